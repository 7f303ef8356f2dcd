#pragma once

#include "platform/framework/document.h"
#include "platform/framework/view.h"

#include <functional>
#include <vector>

namespace kota::test {

// A view that notes what its document tells it.
class RecordingView : public CView {
public:
    struct Update {
        CView* sender;
        LPARAM hint;
        CObject* hintObject;
    };

    explicit RecordingView(CDocument& document) {
        Create();
        document.AddView(this);
    }

    void OnUpdate(CView* sender, LPARAM hint, CObject* hintObject) override {
        updates.push_back({sender, hint, hintObject});
        if (onUpdate)
            onUpdate(hint);
    }

    // The hints in the order in which they came.
    std::vector<LPARAM> hints() const {
        std::vector<LPARAM> all;
        for (const Update& update : updates)
            all.push_back(update.hint);
        return all;
    }

    std::vector<Update> updates;
    // What the view does on a hint, as a page that stores or fills would.
    std::function<void(LPARAM hint)> onUpdate;
};

} // namespace kota::test
