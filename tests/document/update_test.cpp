#include "tests/support/owned.h"
#include "tests/support/recording_view.h"

#include <gmock/gmock.h>

#include <memory>

using namespace kota::test;
using testing::ElementsAre;
using testing::IsEmpty;

namespace {

class UpdatingAll : public testing::Test {
protected:
    OwnedDocument document;
    RecordingView sender{document};
    RecordingView other{document};
    RecordingView third{document};
};

TEST_F(UpdatingAll, MarksTheDocumentAsModified) {
    document.UpdateAll(&sender, 2, nullptr);

    EXPECT_TRUE(document.IsModified());
}

TEST_F(UpdatingAll, MarksItBeforeTheViewsAreTold) {
    BOOL modified = 0;
    other.onUpdate = [&](LPARAM) { modified = document.IsModified(); };

    document.UpdateAll(&sender, 2, nullptr);

    EXPECT_TRUE(modified);
}

TEST_F(UpdatingAll, TellsTheOtherViewsAndLeavesTheSenderOut) {
    CObject object;

    document.UpdateAll(&sender, 2, &object);

    EXPECT_THAT(sender.updates, IsEmpty());
    EXPECT_THAT(other.hints(), ElementsAre(2));
    EXPECT_THAT(third.hints(), ElementsAre(2));
    EXPECT_EQ(other.updates[0].sender, &sender);
    EXPECT_EQ(other.updates[0].hintObject, &object);
}

TEST_F(UpdatingAll, PassesAnyHintOn) {
    document.UpdateAll(&sender, -5, nullptr);
    document.UpdateAll(&third, 0, nullptr);

    EXPECT_THAT(other.hints(), ElementsAre(-5, 0));
}

TEST_F(UpdatingAll, SurvivesASenderThatAnotherViewCloses) {
    auto doomed = std::make_unique<RecordingView>(document);
    other.onUpdate = [&](LPARAM) { doomed.reset(); };

    document.UpdateAll(doomed.get(), 2, nullptr);

    EXPECT_EQ(doomed, nullptr);
    EXPECT_EQ(CWnd::GetFocus(), nullptr);
}

TEST_F(UpdatingAll, GivesTheSenderTheFocusAfterTheOthersWereTold) {
    other.SetFocus();
    const CWnd* whileTold = nullptr;
    third.onUpdate = [&](LPARAM) { whileTold = CWnd::GetFocus(); };

    document.UpdateAll(&sender, 2, nullptr);

    EXPECT_EQ(whileTold, &other);
    EXPECT_EQ(CWnd::GetFocus(), &sender);
}

TEST_F(UpdatingAll, WithoutASenderTellsAllViewsAndMovesNoFocus) {
    third.SetFocus();

    document.UpdateAll(nullptr, 2, nullptr);

    EXPECT_THAT(sender.hints(), ElementsAre(2));
    EXPECT_THAT(other.hints(), ElementsAre(2));
    EXPECT_THAT(third.hints(), ElementsAre(2));
    EXPECT_EQ(CWnd::GetFocus(), &third);
    EXPECT_TRUE(document.IsModified());
}

TEST(UpdatingAllOfADocumentWithoutViews, MarksItAsModified) {
    OwnedDocument document;

    document.UpdateAll(nullptr, 2, nullptr);

    EXPECT_TRUE(document.IsModified());
}

} // namespace
