#pragma once

namespace kota::test {

// While it lives, no tool bar of the program gets its buttons: CKhFlatToolBar::LoadToolBar gives 0.
class FailingButtons {
public:
    FailingButtons();
    ~FailingButtons();
    FailingButtons(const FailingButtons&) = delete;
    FailingButtons& operator=(const FailingButtons&) = delete;
};

} // namespace kota::test
