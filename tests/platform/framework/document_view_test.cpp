#include "platform/framework/document.h"
#include "platform/framework/message_box.h"
#include "platform/framework/view.h"
#include "platform/headless/session.h"

#include <gmock/gmock.h>

#include <functional>
#include <memory>
#include <string>
#include <vector>

namespace {

using testing::ElementsAre;

class PlainDocument : public CDocument {
public:
    BOOL OnOpenDocument(const char* /*path*/) override { return 1; }
    BOOL OnSaveDocument(const char* /*path*/) override { return 1; }
    BOOL DoSave(const char* path) override {
        saved.emplace_back(path);
        return saveResult;
    }

    std::vector<std::string> saved;
    BOOL saveResult = 1;
};

class NamedView : public CView {
public:
    NamedView(CDocument& document, std::string called, std::vector<std::string>& toldNames)
        : name(std::move(called)), told(&toldNames) {
        document.AddView(this);
    }

    void OnUpdate(CView* /*sender*/, LPARAM /*hint*/, CObject* /*hintObject*/) override {
        told->push_back(name);
        if (onUpdate)
            onUpdate();
    }

    std::string name;
    std::vector<std::string>* told;
    std::function<void()> onUpdate;
};

class Views : public testing::Test {
protected:
    std::unique_ptr<NamedView> view(const std::string& name) {
        return std::make_unique<NamedView>(document, name, told);
    }

    PlainDocument document;
    std::vector<std::string> told;
    std::unique_ptr<NamedView> a = view("a");
    std::unique_ptr<NamedView> b = view("b");
    std::unique_ptr<NamedView> c = view("c");
};

TEST_F(Views, AreUpdatedButForTheSender) {
    document.UpdateAllViews(b.get());

    EXPECT_THAT(told, ElementsAre("a", "c"));
}

TEST_F(Views, AreAllUpdatedWithoutASender) {
    document.UpdateAllViews(nullptr);

    EXPECT_THAT(told, ElementsAre("a", "b", "c"));
}

TEST_F(Views, ThatAnUpdateTakesAwayAreNotTold) {
    a->onUpdate = [&] {
        b.reset();
        document.RemoveView(c.get());
    };

    document.UpdateAllViews(nullptr);

    EXPECT_THAT(told, ElementsAre("a"));
    EXPECT_EQ(c->GetDocument(), nullptr);
}

TEST_F(Views, ThatCloseThemselvesDoNoHarm) {
    b->onUpdate = [&] { b.reset(); };

    document.UpdateAllViews(nullptr);

    EXPECT_THAT(told, ElementsAre("a", "b", "c"));
    EXPECT_THAT(document.Views(), ElementsAre(a.get(), c.get()));
}

TEST_F(Views, OutliveTheirDocument) {
    auto passing = std::make_unique<PlainDocument>();
    passing->AddView(a.get());
    EXPECT_THAT(document.Views(), ElementsAre(b.get(), c.get()));

    passing.reset();

    EXPECT_EQ(a->GetDocument(), nullptr);
}

TEST(Document, TakesItsTitleFromItsPath) {
    PlainDocument document;

    document.SetPathName("/rivers/missouri.AD31");

    EXPECT_EQ(document.GetPathName(), "/rivers/missouri.AD31");
    EXPECT_EQ(document.GetTitle(), "missouri.AD31");
}

TEST(Document, IsNewWithoutPathAndChanges) {
    PlainDocument document;
    document.SetPathName("/rivers/missouri.AD31");
    document.SetModifiedFlag();

    EXPECT_EQ(document.OnNewDocument(), 1);

    EXPECT_TRUE(document.GetPathName().IsEmpty());
    EXPECT_FALSE(document.IsModified());
}

class ClosingADocument : public testing::Test {
protected:
    kota::headless::Session session{[](const std::string& text) { ADD_FAILURE() << text; }};
    PlainDocument document;
};

TEST_F(ClosingADocument, WithoutChangesAsksNothing) {
    EXPECT_EQ(document.SaveModified(), 1);
}

TEST_F(ClosingADocument, SavesItsChangesOnYes) {
    document.SetPathName("/rivers/missouri.AD31");
    document.SetModifiedFlag();
    session.screen().answerBox(IDYES);

    EXPECT_EQ(document.SaveModified(), 1);

    EXPECT_THAT(document.saved, ElementsAre("/rivers/missouri.AD31"));
    EXPECT_EQ(session.screen().boxes()[0].text, "Save changes to missouri.AD31?");
    EXPECT_EQ(session.screen().boxes()[0].type, MB_YESNOCANCEL);
}

TEST_F(ClosingADocument, IsNotDoneWhenTheSaveFails) {
    document.SetModifiedFlag();
    document.saveResult = 0;
    session.screen().answerBox(IDYES);

    EXPECT_EQ(document.SaveModified(), 0);
}

TEST_F(ClosingADocument, DropsItsChangesOnNo) {
    document.SetModifiedFlag();
    session.screen().answerBox(IDNO);

    EXPECT_EQ(document.SaveModified(), 1);
    EXPECT_THAT(document.saved, ElementsAre());
}

TEST_F(ClosingADocument, IsNotDoneOnCancel) {
    document.SetModifiedFlag();
    session.screen().answerBox(IDCANCEL);

    EXPECT_EQ(document.SaveModified(), 0);
    EXPECT_THAT(document.saved, ElementsAre());
}

} // namespace
