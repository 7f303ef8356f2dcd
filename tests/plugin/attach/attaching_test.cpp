#include "platform/language/language.h"
#include "tests/plugin/allocations.h"
#include "tests/plugin/attach/watched_records.h"
#include "tests/plugin/plug_in.h"

#include <dlfcn.h>

#include <filesystem>
#include <optional>

using namespace kota::test;

namespace {

// Whether a library is in the process.
bool isLoaded(const char* path) {
    void* const handle = dlopen(path, RTLD_NOW | RTLD_NOLOAD);
    if (handle)
        dlclose(handle);
    return handle != nullptr;
}

// A program in which the plug-in is not attached yet.
class Attaching : public testing::Test {
protected:
    static constexpr int translated = 9001;
    static constexpr int nobodys = 9002; // there is no library of its texts

    Attaching() {
        static const bool found = [] {
            kota::addLanguageFolder(std::filesystem::path(KOTA_LANGUAGE).parent_path().c_str());
            return true;
        }();
        static_cast<void>(found);
        forgetInitialised();
    }
    ~Attaching() override {
        FreeLibrary(library);
        kota::setLanguage(0);
    }

    void SetUp() override {
        if (isLoaded(KOTA_PLUG_IN))
            GTEST_SKIP() << "a build whose libraries cannot be unloaded runs one of these tests in a process";
    }

    void attachIn(int language) {
        kota::setLanguage(language);
        library = kota::loadLibrary(KOTA_PLUG_IN);
        ASSERT_NE(library, nullptr);
    }
    CString editorName() const {
        CString name;
        EXPECT_EQ(exported<int(CString*)>("KhGetEditorString", library)(&name), 1);
        return name;
    }
    CString toolBarName() const {
        CString name;
        EXPECT_EQ((exported<int(CString*, int)>("KhGetToolbarString", library)(&name, 0)), 1);
        return name;
    }
    std::unique_ptr<CMultiDocTemplate> docTemplate() const {
        return std::unique_ptr<CMultiDocTemplate>(
            exported<CMultiDocTemplate*(int)>("KhGetDocTemplatePtr", library)(0));
    }

    HINSTANCE library = nullptr;
};

TEST_F(Attaching, InitialisesTheRecordOfThePlugIn) {
    attachIn(nobodys);

    ASSERT_NE(lastInitialised(), nullptr);
    EXPECT_TRUE(lastInitialised()->initialised);
    EXPECT_EQ(lastInitialised()->library, library);
    EXPECT_EQ(lastInitialised()->resources, nullptr);
    EXPECT_EQ(AfxInitExtensionModule(*lastInitialised(), library), 0) << "that was done";
}

TEST_F(Attaching, MakesThePlugInKnownToTheFramework) {
    attachIn(nobodys);

    ASSERT_NE(lastInitialised(), nullptr);
    EXPECT_TRUE(CDynLinkLibrary::Knows(*lastInitialised()));
}

TEST_F(Attaching, StoresTheLanguageLibraryInTheRecord) {
    attachIn(translated);

    ASSERT_NE(lastInitialised(), nullptr);
    EXPECT_NE(kota::resourcesOf(lastInitialised()->resources), nullptr);
}

TEST_F(Attaching, LoadsTheLibraryOfTheUsersLanguage) {
    EXPECT_FALSE(isLoaded(KOTA_LANGUAGE));

    attachIn(translated);

    EXPECT_TRUE(isLoaded(KOTA_LANGUAGE));
    EXPECT_EQ(editorName(), "Foo");
}

TEST_F(Attaching, LeavesTextsThatTheLanguageLibraryLacksToTheModule) {
    attachIn(translated);

    EXPECT_EQ(toolBarName(), " KOTA 31 AD Tools");
    EXPECT_NE(docTemplate()->Module().menu(4787), nullptr);
}

TEST_F(Attaching, TranslatesTheTemplatesString) {
    using Part = CDocTemplate::DocString;
    attachIn(translated);

    const auto made = docTemplate();

    EXPECT_EQ(made->GetDocString(Part::FileNewName), "Foobar");
    EXPECT_EQ(made->GetDocString(Part::FilterName), "Foobar (*.ad31)");
    EXPECT_EQ(made->GetDocString(Part::FilterExtension), ".ad31");
}

TEST_F(Attaching, SucceedsWithoutALanguageLibrary) {
    attachIn(nobodys);

    EXPECT_FALSE(isLoaded(KOTA_LANGUAGE));
    EXPECT_EQ(editorName(), "AD Parameters");
    EXPECT_EQ(toolBarName(), " KOTA 31 AD Tools");
    EXPECT_NE(docTemplate(), nullptr);
}

TEST_F(Attaching, SucceedsWhenItsAllocationsFail) {
    static std::optional<FailingAllocations> failing;
    beforeInitialising([] { failing.emplace(0, 2); });

    attachIn(translated);

    ASSERT_TRUE(failing);
    EXPECT_TRUE(failing->done());
    failing.reset();
    ASSERT_NE(lastInitialised(), nullptr);
    EXPECT_EQ(lastInitialised()->library, library);
    EXPECT_EQ(lastInitialised()->resources, nullptr);
    EXPECT_EQ(editorName(), "AD Parameters");
    EXPECT_NE(docTemplate(), nullptr);
}

TEST_F(Attaching, IsKnownToTheFrameworkWhenTheLanguageLibraryCannotBeAllocated) {
    static std::optional<FailingAllocations> failing;
    beforeInitialising([] { failing.emplace(0); });

    attachIn(translated);

    failing.reset();
    ASSERT_NE(lastInitialised(), nullptr);
    EXPECT_EQ(lastInitialised()->resources, nullptr);
    EXPECT_TRUE(CDynLinkLibrary::Knows(*lastInitialised()));
}

TEST_F(Attaching, MakesTheClassesKnownByTheirNames) {
    EXPECT_EQ(CRuntimeClass::FromName("CKota0_adDoc"), nullptr);

    attachIn(nobodys);

    const CRuntimeClass* const known = CRuntimeClass::FromName("CKota0_adDoc");
    ASSERT_NE(known, nullptr);
    EXPECT_EQ(known, docTemplate()->DocumentClass());
}

TEST_F(Attaching, ThenDetachingGivesTheLanguageLibraryBack) {
    attachIn(translated);

    EXPECT_EQ(FreeLibrary(library), 1);

    if (isLoaded(KOTA_PLUG_IN))
        GTEST_SKIP() << "a build whose libraries cannot be unloaded";
    EXPECT_FALSE(isLoaded(KOTA_LANGUAGE));
    EXPECT_EQ(CRuntimeClass::FromName("CKota0_adDoc"), nullptr);
    EXPECT_EQ(FreeLibrary(library), 0);
}

TEST_F(Attaching, MayBeDoneAgainInAnotherLanguage) {
    attachIn(nobodys);
    FreeLibrary(library);
    if (isLoaded(KOTA_PLUG_IN))
        GTEST_SKIP() << "a build whose libraries cannot be unloaded";

    attachIn(translated);

    EXPECT_EQ(editorName(), "Foo");
}

} // namespace
