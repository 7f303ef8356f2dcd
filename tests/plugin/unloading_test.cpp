#include "tests/plugin/second_library.h"
#include "tests/support/temp_folder.h"

#include <filesystem>

using namespace kota::test;

namespace {

// Copies of the second plug-in and of its language library, which come and go without the originals.
class UnloadingAPlugIn : public testing::Test {
protected:
    UnloadingAPlugIn() { findSecondLanguage(); }

    HINSTANCE loadCopy(const char* library, const std::string& name) {
        std::filesystem::copy_file(library, folder.file(name));
        return kota::loadLibrary(folder.file(name).c_str());
    }
    static const kota::Module& moduleOf(HINSTANCE library) {
        const std::unique_ptr<CMultiDocTemplate> docTemplate(
            exported<CMultiDocTemplate*(int)>("KhGetDocTemplatePtr", library)(0));
        return docTemplate->Module();
    }

    TempFolder folder;

private:
    const LanguageChoice english{1033};
};

class APlugInInALanguage : public UnloadingAPlugIn {
protected:
    // The editor's name as a copy gives it that was loaded in a language.
    CString nameIn(int language) {
        const LanguageChoice choice(language);
        const HINSTANCE copy = loadCopy(KOTA_SECOND, std::to_string(language) + ".so");
        CString name;
        exported<int(CString*)>("KhGetEditorString", copy)(&name);
        FreeLibrary(copy);
        return name;
    }
};

TEST_F(APlugInInALanguage, ThatThereIsNoLibraryForGivesItsOwnTexts) {
    EXPECT_EQ(nameIn(1033), "Translated name");
    EXPECT_EQ(nameIn(1041), "Plain name");
}

TEST_F(UnloadingAPlugIn, TakesItsClassesAway) {
    const HINSTANCE copy = loadCopy(KOTA_SECOND, "copy.so");
    ASSERT_NE(copy, nullptr);
    const kota::Module* const module = &moduleOf(copy);
    ASSERT_NE(CRuntimeClass::FromName("CDlgFrame", module), nullptr);

    EXPECT_EQ(FreeLibrary(copy), 1);

    EXPECT_EQ(CRuntimeClass::FromName("CDlgFrame", module), nullptr);
}

TEST_F(UnloadingAPlugIn, GivesItsLanguageLibraryBack) {
    std::filesystem::copy_file(KOTA_SECOND_LANGUAGE, folder.file("libSecond_9003.so"));
    kota::addLanguageFolder(folder.file("").c_str());
    const LanguageChoice nobodysElse(9003);
    const HINSTANCE copy = loadCopy(KOTA_SECOND, "copy.so");
    ASSERT_NE(copy, nullptr);
    const HINSTANCE language = exported<AFX_EXTENSION_MODULE*()>("SecondRecord", copy)()->resources;
    ASSERT_NE(language, nullptr);

    FreeLibrary(copy);

    EXPECT_EQ(FreeLibrary(language), 0) << "it is given back already";
}

TEST_F(UnloadingAPlugIn, LeavesOtherLibrariesLoaded) {
    const HINSTANCE copy = loadCopy(KOTA_SECOND, "copy.so");
    const HINSTANCE first = loadCopy(KOTA_SECOND_LANGUAGE, "first.so");
    const HINSTANCE second = loadCopy(KOTA_SECOND_LANGUAGE, "second.so");
    const HINSTANCE third = loadCopy(KOTA_SECOND_LANGUAGE, "third.so");
    ASSERT_TRUE(copy && first && second && third);

    EXPECT_EQ(FreeLibrary(copy), 1);

    EXPECT_EQ(FreeLibrary(nullptr), 0);
    EXPECT_EQ(FreeLibrary(first), 1);
    EXPECT_EQ(FreeLibrary(second), 1);
    EXPECT_EQ(FreeLibrary(third), 1);
}

} // namespace
