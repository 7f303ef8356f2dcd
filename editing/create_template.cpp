#include "editing/create_template.h"

#include "document/kota0_ad_doc.h"
#include "editing/dlg_frame.h"
#include "editing/kota0_ad_view.h"
#include "platform/framework/template.h"
#include "resources/ids.h"

CMultiDocTemplate* createTemplate() {
    return new CMultiDocTemplate(StringId::DocTemplate, RUNTIME_CLASS(CKota0_adDoc), RUNTIME_CLASS(CDlgFrame),
                                 RUNTIME_CLASS(CKota0_adView));
}
