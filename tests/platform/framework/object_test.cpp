#include "platform/framework/list.h"
#include "platform/framework/object.h"

#include <gtest/gtest.h>

#include <memory>

namespace {

constexpr kota::StringResource strings[] = {{1, "one"}, {7, "seven"}};

const kota::Module& thisModule() {
    static const kota::Module module("this", {.strings = strings});
    return module;
}

const kota::Module& otherModule() {
    static const kota::Module module("other", kota::Resources{});
    return module;
}

class Shape : public CObject {
    DECLARE_DYNAMIC(Shape)
};
IMPLEMENT_DYNAMIC(Shape, CObject, thisModule)

class Circle : public Shape {
    DECLARE_DYNCREATE(Circle)
};
IMPLEMENT_DYNCREATE(Circle, Shape, thisModule)

namespace other {
class Circle : public CObject {
    DECLARE_DYNCREATE(Circle)
};
IMPLEMENT_DYNCREATE(Circle, CObject, otherModule)
} // namespace other

TEST(RuntimeClass, KnowsWhatAnObjectIs) {
    const Circle circle;

    EXPECT_TRUE(circle.IsKindOf(RUNTIME_CLASS(Circle)));
    EXPECT_TRUE(circle.IsKindOf(RUNTIME_CLASS(Shape)));
    EXPECT_TRUE(circle.IsKindOf(RUNTIME_CLASS(CObject)));
    EXPECT_FALSE(circle.IsKindOf(RUNTIME_CLASS(CObList)));
    EXPECT_FALSE(circle.IsKindOf(nullptr));
    EXPECT_FALSE(Shape().IsKindOf(RUNTIME_CLASS(Circle)));
}

TEST(RuntimeClass, MakesAnObjectByName) {
    const std::unique_ptr<CObject> object(CRuntimeClass::CreateObject("Circle"));

    ASSERT_NE(object, nullptr);
    EXPECT_TRUE(object->IsKindOf(RUNTIME_CLASS(Circle)));
}

TEST(RuntimeClass, OfTheSameNameInAnotherModuleIsAnother) {
    EXPECT_EQ(CRuntimeClass::FromName("Circle", &thisModule()), RUNTIME_CLASS(Circle));
    EXPECT_EQ(CRuntimeClass::FromName("Circle", &otherModule()), &other::Circle::classCircle);
    EXPECT_EQ(CRuntimeClass::FromName("Shape", &otherModule()), nullptr);

    const std::unique_ptr<CObject> object(CRuntimeClass::CreateObject("Circle", &otherModule()));
    EXPECT_TRUE(object->IsKindOf(&other::Circle::classCircle));
    EXPECT_EQ(&object->GetRuntimeClass()->Module(), &otherModule());
}

TEST(RuntimeClass, WithoutAFactoryMakesNothing) {
    EXPECT_NE(CRuntimeClass::FromName("Shape"), nullptr);
    EXPECT_EQ(CRuntimeClass::CreateObject("Shape"), nullptr);
    EXPECT_EQ(CRuntimeClass::CreateObject("NoSuchClass"), nullptr);
}

TEST(RuntimeClass, IsKnownForAsLongAsItLives) {
    {
        const CRuntimeClass passing("Passing", RUNTIME_CLASS(CObject), thisModule, nullptr);
        EXPECT_EQ(CRuntimeClass::FromName("Passing"), &passing);
    }
    EXPECT_EQ(CRuntimeClass::FromName("Passing"), nullptr);
}

TEST(Module, GivesTheTextsOfItsStringTable) {
    EXPECT_EQ(thisModule().string(7), "seven");
    EXPECT_EQ(thisModule().string(2), "");
    EXPECT_EQ(otherModule().string(7), "");
    EXPECT_STREQ(thisModule().name(), "this");
}

} // namespace
