#include "tests/platform/windows/test_sheet.h"

namespace kota::test {

namespace {

constexpr DialogItem valueItems[] = {field("Value", ValueEdit), field("Other", OtherEdit)};
constexpr DialogItem labelItems[] = {label("Nothing to enter")};
constexpr DialogTemplate dialogs[] = {{.id = FirstPage, .caption = "First", .items = valueItems},
                                      {.id = SecondPage, .caption = "Second", .items = valueItems},
                                      {.id = EmptyPage, .caption = "Empty", .items = labelItems}};

const Module& sheetModule() {
    static const Module module("sheet test", {.dialogs = dialogs});
    return module;
}

} // namespace

IMPLEMENT_DYNAMIC(NotingPage, CPropertyPage, sheetModule)

} // namespace kota::test
