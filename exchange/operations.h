#pragma once

#include "platform/framework/list.h"
#include "platform/framework/text.h"

class CKota0_adView;

// What sibling editors do with a document's located data. Without a view, `path` is opened. Of a list of
// items, the first one counts. None of the four is available yet: they do nothing.
namespace exchange {

// A new list of new items, one for each record with a place, which the caller owns; or null.
CObList* GetData(CString path, CKota0_adView* view);
void InsertData(CString path, CKota0_adView* view, CObList* items);
void DeleteData(CString path, CKota0_adView* view, CObList* items);
void SelectData(CString path, CKota0_adView* view, CObList* items);

} // namespace exchange
