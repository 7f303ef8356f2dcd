#include "exchange/operations.h"

namespace exchange {

CObList* GetData(CString /*path*/, CKota0_adView* /*view*/) {
    return nullptr;
}
void InsertData(CString /*path*/, CKota0_adView* /*view*/, CObList* /*items*/) {}
void DeleteData(CString /*path*/, CKota0_adView* /*view*/, CObList* /*items*/) {}
void SelectData(CString /*path*/, CKota0_adView* /*view*/, CObList* /*items*/) {}

} // namespace exchange
