#pragma once

#include "exchange/packages/packages.h"
#include "platform/framework/frame.h"
#include "platform/framework/view.h"

#include <functional>
#include <vector>

namespace kota::test {

// The view of another editor, in a frame in the place of its own: notes what an editor told all others.
class HearingView : public CView {
public:
    explicit HearingView(CFrameWnd& frame) : frame_(frame), before_(frame.GetActiveView()) {
        Create();
        frame.SetActiveView(this);
    }
    ~HearingView() override {
        if (GetSafeHwnd())
            frame_.SetActiveView(before_);
    }

    LRESULT WindowProc(UINT message, WPARAM wParam, LPARAM lParam) override {
        if (message != communicationMessage())
            return CView::WindowProc(message, wParam, lParam);
        codes.push_back(wParam);
        packages.push_back(reinterpret_cast<const CKHComm_Package*>(lParam));
        if (onMessage)
            onMessage();
        return 1;
    }

    std::vector<WPARAM> codes;
    std::vector<const CKHComm_Package*> packages; // not to be looked into: they are gone
    std::function<void()> onMessage;

private:
    CFrameWnd& frame_;
    CView* before_;
};

} // namespace kota::test
