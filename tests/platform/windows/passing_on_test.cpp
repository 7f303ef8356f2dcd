#include "tests/platform/windows/test_document.h"
#include "tests/support/hearing_view.h"

#include "exchange/packages/packages.h"

namespace {

using kota::test::HearingView;
using testing::ElementsAre;
using testing::IsEmpty;

// Two windows of other editors, in the order in which they hear.
class WhatAnEditorTells : public kota::test::WithDocuments {
protected:
    LRESULT tell(UINT message, WPARAM code, const CKHComm_Package* package = nullptr) {
        return session.mainWindow().SendMessage(message, code, reinterpret_cast<LPARAM>(package));
    }

    kota::test::TestTemplate& docTemplate = know();
    HearingView first{frameOf(*openWith(docTemplate, "/rivers/a.tst"))};
    HearingView second{frameOf(*openWith(docTemplate, "/rivers/b.tst"))};
};

TEST_F(WhatAnEditorTells, IsHandedOnToAllOfThem) {
    const CKHComm_Package package;

    EXPECT_EQ(tell(communicationMessage(), 523, &package), 0);
    EXPECT_EQ(tell(communicationMessage(), 503), 0);

    EXPECT_THAT(first.codes, ElementsAre(523U, 503U));
    EXPECT_THAT(first.packages, ElementsAre(&package, nullptr));
    EXPECT_THAT(second.codes, ElementsAre(523U, 503U));
    EXPECT_THAT(second.packages, ElementsAre(&package, nullptr));
}

TEST_F(WhatAnEditorTells, IsHandedOnAfterTheShellHasIt) {
    std::size_t heardBefore = 7;
    session.mainWindow().onMessage = [&](const auto&) { heardBefore = first.codes.size(); };

    tell(communicationMessage(), 523);

    EXPECT_EQ(heardBefore, 0U);
    EXPECT_EQ(session.mainWindow().received(523).size(), 1U);
    session.mainWindow().onMessage = nullptr;
}

TEST_F(WhatAnEditorTells, IsNotWhatOneEditorAsksAnother) {
    for (const WPARAM code : {42U, 62U, 82U})
        tell(communicationMessage(), code);

    EXPECT_THAT(first.codes, IsEmpty());
}

TEST_F(WhatAnEditorTells, IsNotWhatItAsksTheShell) {
    const CKHComm_Package package;
    for (const WPARAM code : {24U, 25U, 52U, 200U, 503U, 523U})
        tell(switchBoardMessage(), code, &package);

    EXPECT_THAT(first.codes, IsEmpty());
}

TEST_F(WhatAnEditorTells, PassesAViewThatIsClosedMeanwhile) {
    first.onMessage = [&] { second.DestroyWindow(); };

    tell(communicationMessage(), 523);

    EXPECT_THAT(first.codes, ElementsAre(523U));
    EXPECT_THAT(second.codes, IsEmpty());
}

} // namespace
