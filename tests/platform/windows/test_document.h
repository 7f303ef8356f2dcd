#pragma once

#include "tests/platform/windows/test_windows.h"

#include "platform/framework/document.h"
#include "platform/framework/frame.h"
#include "platform/framework/template.h"

#include <memory>
#include <string>
#include <vector>

namespace kota::test {

// What a document of a test kind is: its file is opened unless its name has "bad" in it, a save is noted.
class TestDocument : public CDocument {
    DECLARE_DYNCREATE(TestDocument)
public:
    TestDocument() { ++living; }
    ~TestDocument() override { --living; }

    BOOL OnNewDocument() override { return newWorks && CDocument::OnNewDocument(); }
    BOOL OnOpenDocument(const char* path) override {
        return std::string_view(path).find("bad") == std::string_view::npos;
    }
    BOOL OnSaveDocument(const char* /*path*/) override { return TRUE; }
    BOOL DoSave(const char* path) override {
        saved.emplace_back(path);
        SetModifiedFlag(!saveWorks);
        return saveWorks;
    }
    void DeleteContents() override { ++emptied; }

    static inline int living = 0;
    static inline int emptied = 0;
    static inline bool newWorks = true;
    static inline bool saveWorks = true;
    static inline std::vector<std::string> saved;
};

// A view that notes what happens to all of its kind.
class TestView : public CView {
    DECLARE_DYNCREATE(TestView)
public:
    TestView() { ++living; }
    ~TestView() override { --living; }

    BOOL CreateView(CFrameWnd* frame, const CCreateContext& context) override {
        return CView::CreateView(frame, context) && creationWorks;
    }
    void OnInitialUpdate() override {
        ++initialUpdates;
        CView::OnInitialUpdate();
    }
    void OnActivateView(BOOL activate, CView* activateView, CView* deactiveView) override {
        activations.push_back({this, activate != 0, activateView, deactiveView});
        if (onActivate)
            onActivate(*this, activate != 0);
    }

    struct Activation {
        CView* view;
        bool activate;
        CView* activateView;
        CView* deactiveView;
        friend bool operator==(const Activation&, const Activation&) = default;
    };

    static inline int living = 0;
    static inline int initialUpdates = 0;
    static inline bool creationWorks = true;
    static inline std::vector<Activation> activations;
    static inline std::function<void(TestView&, bool)> onActivate;
};

// Counts the templates that are there.
class TestTemplate : public CMultiDocTemplate {
public:
    explicit TestTemplate(UINT id = 1);
    ~TestTemplate() override { --living; }

    static inline int living = 0;
};

// A shell in which documents of the test kind are opened. All counts are as new.
class WithDocuments : public WithSession {
protected:
    WithDocuments();
    ~WithDocuments() override;

    // A template that the application knows.
    TestTemplate& know(UINT id = 1) {
        auto made = std::make_unique<TestTemplate>(id);
        TestTemplate& known = *made;
        session.application().AddDocTemplate(std::move(made));
        return known;
    }
    // In a turn of its own.
    static CDocument* openWith(CDocTemplate& docTemplate, const char* path) {
        const Turn turn;
        return docTemplate.OpenDocumentFile(path);
    }
    static CFrameWnd& frameOf(const CDocument& document, std::size_t view = 0) {
        return *document.Views().at(view)->GetParentFrame();
    }
    std::vector<CMDIChildWnd*> frames() { return session.mainWindow().Children(); }
};

} // namespace kota::test
