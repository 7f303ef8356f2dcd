#pragma once

#include "editing/base/gen_property_page.h"
#include "editing/create_template.h"
#include "editing/kota0_ad_view.h"
#include "platform/framework/template.h"
#include "platform/headless/session.h"
#include "platform/headless/user.h"
#include "tests/support/owned.h"

#include <gtest/gtest.h>

namespace kota::test {

// A user in front of a tab of a new document, of the editor's own objects, so that the page can be reached.
class OnAPage : public testing::Test {
protected:
    explicit OnAPage(const char* tab) {
        session.application().AddDocTemplate(std::unique_ptr<CDocTemplate>(createTemplate()));
        session.create();
        user.emplace(session);
        EXPECT_TRUE(user->selectTab(tab));
    }

    CKota0_adDoc& document() { return *static_cast<CKota0_adDoc*>(user->view().GetDocument()); }
    CGenPropertyPage& page() { return static_cast<CGenPropertyPage&>(user->page()); }
    void fill() { document().UpdateAllViews(nullptr, UpdateHint::Fill, nullptr); }

    headless::Session session{[](const std::string& text) { ADD_FAILURE() << text; }};
    std::optional<headless::User> user;
};

} // namespace kota::test
