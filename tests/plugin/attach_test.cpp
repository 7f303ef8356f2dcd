#include "tests/plugin/second_library.h"
#include "tests/support/temp_folder.h"

using namespace kota::test;

namespace {

AFX_EXTENSION_MODULE& secondRecord() {
    return *exported<AFX_EXTENSION_MODULE*()>("SecondRecord", secondPlugIn())();
}

TEST(AnExtensionModule, IsInitialisedOnce) {
    AFX_EXTENSION_MODULE record;

    EXPECT_EQ(AfxInitExtensionModule(record, plugIn()), 1);
    EXPECT_TRUE(record.initialised);
    EXPECT_EQ(record.library, plugIn());

    EXPECT_EQ(AfxInitExtensionModule(record, secondPlugIn()), 0);
    EXPECT_EQ(record.library, plugIn()) << "as it was";
}

TEST(AnExtensionModule, HasNoLibraryOfTextsBeforeOneIsLoaded) {
    AFX_EXTENSION_MODULE record;

    AfxInitExtensionModule(record, plugIn());

    EXPECT_EQ(record.resources, nullptr);
}

TEST(AnExtensionModule, OfALoadedPlugInIsInitialised) {
    EXPECT_TRUE(secondRecord().initialised);
    EXPECT_EQ(secondRecord().library, secondPlugIn());
    EXPECT_EQ(AfxInitExtensionModule(secondRecord(), nullptr), 0);
}

TEST(AnExtensionModule, OfALoadedPlugInIsKnownToTheFramework) {
    EXPECT_TRUE(CDynLinkLibrary::Knows(secondRecord()));
}

TEST(AnExtensionModule, OfALoadedPlugInHasItsLibraryOfTexts) {
    EXPECT_NE(kota::resourcesOf(secondRecord().resources), nullptr);
}

TEST(ADynLinkLibrary, IsKnownForAsLongAsItLives) {
    AFX_EXTENSION_MODULE record;
    AFX_EXTENSION_MODULE other;
    EXPECT_FALSE(CDynLinkLibrary::Knows(record));
    {
        const CDynLinkLibrary entry(record, FALSE);
        EXPECT_TRUE(CDynLinkLibrary::Knows(record));
        EXPECT_FALSE(CDynLinkLibrary::Knows(other));
    }
    EXPECT_FALSE(CDynLinkLibrary::Knows(record));
}

TEST(ADynLinkLibrary, IsKnownUntilTheLastOfItsRecordIsGone) {
    AFX_EXTENSION_MODULE record;
    const CDynLinkLibrary first(record);
    { const CDynLinkLibrary second(record); }

    EXPECT_TRUE(CDynLinkLibrary::Knows(record));
}

TEST(ALanguageLibrary, IsLoadedAndItsHandleStored) {
    findSecondLanguage();
    const LanguageChoice english(1033);
    HINSTANCE stored = nullptr;

    const HINSTANCE library = KhLangLoadResDll("Second", &stored, 0);

    ASSERT_NE(library, nullptr);
    EXPECT_EQ(stored, library);
    ASSERT_NE(kota::resourcesOf(library), nullptr);
    EXPECT_EQ(kota::resourcesOf(library)->strings.size(), 2U);
    EXPECT_EQ(FreeLibrary(library), 1);
}

TEST(ALanguageLibrary, ThatIsMissingLeavesTheHandleAsItWas) {
    findSecondLanguage();
    const LanguageChoice english(1033);
    const HINSTANCE before = plugIn();
    HINSTANCE stored = before;

    EXPECT_EQ(KhLangLoadResDll("NoSuchPlugIn", &stored, 0), nullptr);

    EXPECT_EQ(stored, before);
}

TEST(ALanguageLibrary, IsThatOfTheUsersLanguage) {
    findSecondLanguage();
    const LanguageChoice japanese(1041);
    HINSTANCE stored = nullptr;

    EXPECT_EQ(KhLangGetLanguage(), 1041);
    EXPECT_EQ(KhLangLoadResDll("Second", &stored, 0), nullptr) << "there is none in Japanese";

    EXPECT_EQ(stored, nullptr);
}

// A library that nobody else has loaded.
class FreeingALibrary : public testing::Test {
protected:
    FreeingALibrary() { std::filesystem::copy_file(KOTA_SECOND_LANGUAGE, path); }

    TempFolder folder;
    const std::string path = folder.file("copy.so");
};

TEST_F(FreeingALibrary, GivesZeroForNull) {
    EXPECT_EQ(FreeLibrary(nullptr), 0);
}

TEST_F(FreeingALibrary, GivesZeroWhenItIsGivenBackAlready) {
    const HINSTANCE library = kota::loadLibrary(path.c_str());
    ASSERT_NE(library, nullptr);

    EXPECT_EQ(FreeLibrary(library), 1);

    EXPECT_EQ(FreeLibrary(library), 0);
}

TEST_F(FreeingALibrary, LeavesItToThoseWhoLoadedItAgain) {
    const HINSTANCE library = kota::loadLibrary(path.c_str());
    ASSERT_NE(library, nullptr);
    EXPECT_EQ(kota::loadLibrary(path.c_str()), library);

    EXPECT_EQ(FreeLibrary(library), 1);

    EXPECT_NE(kota::resourcesOf(library), nullptr);
    EXPECT_NE(kota::symbolOf(library, "KotaResources"), nullptr);
    EXPECT_EQ(FreeLibrary(library), 1);
    EXPECT_EQ(FreeLibrary(library), 0);
}

TEST(LoadingALibrary, TellsWhyItFailed) {
    const char* problem = nullptr;

    EXPECT_EQ(kota::loadLibrary("/no/such/library.so", &problem), nullptr);

    ASSERT_NE(problem, nullptr);
    EXPECT_NE(std::string(problem).find("/no/such/library.so"), std::string::npos);
}

TEST(LoadingALibrary, MakesItTheOneThatItsAddressesLieIn) {
    void* const address = kota::symbolOf(plugIn(), "KhGetBitmapId");
    ASSERT_NE(address, nullptr);

    EXPECT_EQ(kota::libraryAt(address), plugIn());
    EXPECT_EQ(kota::libraryAt(&secondRecord()), secondPlugIn());
    EXPECT_EQ(kota::libraryAt(nullptr), nullptr);
}

TEST(LoadingALibrary, FindsNoTablesWhereThereAreNone) {
    EXPECT_EQ(kota::resourcesOf(nullptr), nullptr);
    EXPECT_EQ(kota::resourcesOf(plugIn()), nullptr);
    EXPECT_EQ(kota::symbolOf(plugIn(), "KotaResources"), nullptr);
}

} // namespace
