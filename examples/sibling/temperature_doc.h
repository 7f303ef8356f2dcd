#pragma once

#include "platform/foundation/kh_doc.h"

class CKota0_adDoc;

// The temperature of the water that the decay constants of an AD document hold for: a .wtemp file beside it.
class CTemperatureDoc : public CKhDoc {
    DECLARE_DYNCREATE(CTemperatureDoc)
public:
    void DeleteContents() override;
    BOOL OnOpenDocument(const char* path) override;
    BOOL OnSaveDocument(const char* path) override;

    // The AD document, null when it is not open. The user may close it at any time: nobody keeps the pointer.
    CKota0_adDoc* FindAdDocument() const;
    // The same, opened in a window of its own if need be; null when that failed, which the user was told.
    CKota0_adDoc* OpenAdDocument() const;
    // Brings the AD document's constants to another temperature. False when there is no AD document, or the
    // user stands in a cell of it whose text is refused.
    bool Correct(double wanted);
    // Saves the AD document, and then this one.
    bool SaveBoth();

    CString adName; // the AD document's file, as seen from this one's folder
    CString component;
    double temperature = 20.0; // degrees Celsius

private:
    CString AdPath() const;
};
