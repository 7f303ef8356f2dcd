#pragma once

#include "editing/kota0_ad_view.h"
#include "exchange/packages/packages.h"
#include "platform/foundation/units.h"
#include "platform/framework/document.h"
#include "platform/framework/frame.h"
#include "platform/framework/property_sheet.h"
#include "tests/support/editor.h"
#include "tests/support/owned.h"

#include <string>
#include <vector>

namespace kota::test {

// The user's choice of a display unit, the base unit again when it goes.
class UnitChoice {
public:
    UnitChoice(int item, int unit) : item_(item) { setDisplayUnit(item, unit); }
    ~UnitChoice() { setDisplayUnit(item_, 0); }
    UnitChoice(const UnitChoice&) = delete;
    UnitChoice& operator=(const UnitChoice&) = delete;

private:
    int item_;
};

// A shell with a document's window, for tests of what the view does.
class DocumentWindow : public Editor {
protected:
    // What a test listens with does not live as long as the session.
    ~DocumentWindow() override {
        shell().onMessage = nullptr;
        session.screen().onBox = nullptr;
    }

    // The n-th view of a document, from 1, in the order in which they were made.
    static CKota0_adView& viewOf(const CKota0_adDoc& document, std::size_t n = 1) {
        return *static_cast<CKota0_adView*>(document.Views().at(n - 1));
    }

    // A local line, before its tab was shown.
    static AD_Dispersion& addDispersion(CKota0_adDoc& document, const char* river, double chainage) {
        return addLocal(document.dispersList, 0, river, chainage);
    }

    // A document with two local lines, shown in its tab, with the cursor in the first cell.
    CKota0_adDoc& createDispersion() {
        CKota0_adDoc& document = create();
        addDispersion(document, "MISSOURI", 1000.0);
        addDispersion(document, "PLATTE", 2000.0);
        headless::User(session).selectTab("Dispersion");
        settle(document);
        return document;
    }

    // Takes all that was there so far for granted.
    void settle(CKota0_adDoc& document) {
        document.SetModifiedFlag(FALSE);
        shell().forgetReceived();
    }

    // What the shell was told, in its order, as "503" or "show".
    std::vector<std::string> told() {
        std::vector<std::string> names;
        for (const headless::Received& message : shell().received()) {
            if (message.message == showToolbarMessage())
                names.emplace_back("show");
            else if (message.message == hideToolbarMessage())
                names.emplace_back("hide");
            else
                names.push_back(std::to_string(message.code));
        }
        return names;
    }

    std::size_t times(WPARAM code) { return shell().received(code).size(); }

    // The rivers of the document's dispersion lines.
    static std::vector<std::string> riversOf(const CKota0_adDoc& document) {
        std::vector<std::string> rivers;
        for (const AD_Dispersion* line : recordsOf(document.dispersList))
            rivers.emplace_back(line->riverName.View());
        return rivers;
    }
};

// The captions of the tabs, in their order.
inline const std::vector<std::string> tabCaptions = {
    "Components",      "Dispersion",        "KOTA 32 Dispersion",       "Init.Cond.", "Decay", "Cohesive ST",
    "Sediment Layers", "Additional output", "KOTA 32 Additional output"};

} // namespace kota::test
