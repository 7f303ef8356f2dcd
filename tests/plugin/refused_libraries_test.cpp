#include "platform/foundation/plug_in.h"
#include "tests/plugin/plug_in.h"

#include <gmock/gmock.h>

#include <stdexcept>
#include <string>

namespace {

using testing::HasSubstr;

// The words with which a library was refused; empty when it was not.
std::string refusal(const std::string& path) {
    try {
        const kota::PlugIn plugIn(path);
        return {};
    } catch (const std::runtime_error& error) {
        return error.what();
    }
}

TEST(ALibrary, IsNoPlugInWhenItIsNotThere) {
    EXPECT_THAT(refusal("/no/such/library.so"), HasSubstr("/no/such/library.so"));
}

TEST(ALibrary, IsNoPlugInWithoutAVersion) {
    EXPECT_EQ(refusal(KOTA_SECOND_LANGUAGE),
              std::string(KOTA_SECOND_LANGUAGE) + " is not a plug-in of this program");
}

TEST(ALibrary, IsNoPlugInOfAnotherVersion) {
    const std::string own = std::to_string(kota::abiVersion);
    const std::string other = std::to_string(kota::abiVersion + 1);

    EXPECT_EQ(refusal(KOTA_SECOND_OF_ANOTHER_VERSION), std::string(KOTA_SECOND_OF_ANOTHER_VERSION) +
                                                           " was built for version " + other +
                                                           " of the platform; this is version " + own);
}

TEST(ALibrary, IsNoPlugInWithoutTheExports) {
    EXPECT_EQ(refusal(KOTA_UNFINISHED),
              std::string(KOTA_UNFINISHED) + " does not export KhGetNumDocTemplates");
}

TEST(ALibrary, IsAPlugInWithThisVersionAndTheExports) {
    EXPECT_EQ(refusal(KOTA_PLUG_IN), "");
}

} // namespace
