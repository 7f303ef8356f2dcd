#include "tests/platform/kvs/kvs_files.h"

// What is asked of nothing is nothing, and no failure.
namespace {

using namespace kvs_test;

class NullHandles : public FileLibrary {
protected:
    ~NullHandles() override { EXPECT_EQ(kvsPeekErrorGlb(), 0); }
};

TEST_F(NullHandles, HoldNothing) {
    EXPECT_EQ(kvsTargetByNameNum(nullptr, "T", 1), nullptr);
    EXPECT_EQ(kvsSectionByNameNum(nullptr, "S", 1), nullptr);
    EXPECT_EQ(kvsKeywordByNameNum(nullptr, "K", 1), nullptr);
    EXPECT_EQ(kvsParamByNum(nullptr, 1), nullptr);
}

TEST_F(NullHandles, AreZeroFalseAndEmpty) {
    EXPECT_EQ(kvsGetInt(nullptr), 0);
    EXPECT_EQ(kvsGetDouble(nullptr), 0.0);
    EXPECT_FALSE(kvsGetBool(nullptr));
    EXPECT_EQ(stringOf(nullptr), "");
}

TEST_F(NullHandles, HaveNoSyntaxError) {
    int line = 7;
    int column = 7;
    CString text = "before";

    EXPECT_EQ(kvsGetSyntaxErr(nullptr, &line, &column, &text), 0);

    EXPECT_EQ(line, 0);
    EXPECT_EQ(column, 0);
    EXPECT_TRUE(text.IsEmpty());
}

TEST_F(NullHandles, TakeWhatIsAddedAndForgetIt) {
    kvsAddTarget(nullptr, "T");
    kvsAddSection(nullptr, "S");
    kvsAddKeyword(nullptr, "K");
    kvsAddInt(nullptr, 1);
    kvsAddDouble(nullptr, 1.0);
    kvsAddBool(nullptr, true);
    kvsAddString(nullptr, "x");
    kvsPutListParam(nullptr, "L", "id", 1, 2.0);
    kvsEndSection(nullptr);

    EXPECT_EQ(kvsPeekErrorGlb(), 0);
}

TEST_F(NullHandles, AppendNothing) {
    const TempFolder folder;

    EXPECT_EQ(kvsAppend(nullptr, folder.file("f.ad31").c_str()), 0);

    EXPECT_FALSE(folder.has("f.ad31"));
}

TEST_F(NullHandles, MayBeClosed) {
    void* none = nullptr;

    kvsClose(&none);
    kvsClose(nullptr);

    EXPECT_EQ(none, nullptr);
}

TEST_F(NullHandles, AreWhatAClosedHandleBecomes) {
    void* file = kvsCreate();

    kvsClose(&file);

    EXPECT_EQ(file, nullptr);
}

TEST_F(NullHandles, AreNotTheOnlyOnesThatHoldNothing) {
    const Handle created(kvsCreate());

    EXPECT_EQ(kvsTargetByNameNum(created, "T", 1), nullptr);
}

TEST_F(NullHandles, ANullNameIsTheEmptyName) {
    const Loaded loaded("target \"\" { section \"\" { \"\" = 5\n} }");

    void* const section = kvsSectionByNameNum(loaded.target(nullptr), nullptr, 1);

    EXPECT_EQ(kvsGetInt(kvsParamByNum(kvsKeywordByNameNum(section, nullptr, 1), 1)), 5);
}

TEST_F(NullHandles, AddressesForTheSyntaxErrorMayBeNull) {
    const Loaded loaded("{");

    EXPECT_EQ(kvsGetSyntaxErr(loaded.file(), nullptr, nullptr, nullptr), 1);
}

} // namespace
