#pragma once

#include "exchange/packages/packages.h"
#include "platform/foundation/frames.h"
#include "platform/headless/project.h"

#include <functional>
#include <optional>
#include <vector>

namespace kota::headless {

// One message of an editor to the shell, with what its package held at the time.
struct Received {
    UINT message = 0; // as registered
    WPARAM code = 0;
    bool hasPackage = false;
    CView* sender = nullptr; // may be gone by now
    CString documentName;
    std::int32_t packageKind = 0;
    std::intptr_t project = 0;
    CObject* items = nullptr;         // the sender's; may be gone by now
    std::optional<Location> location; // of LocationChanged: what the item held
};

// The main window of a shell: answers the editors' requests from a project given to it, records what they
// send, and hands on to all of them what one tells (CommunicationCode::isToldToAll).
class MainWindow : public CKhMDIFrameWnd {
public:
    MainWindow();
    ~MainWindow() override;

    // The handle that code 25 is answered with; 0 means that no project is open.
    void openProject(std::intptr_t handle) { project_.handle = handle; }
    Project& project() { return project_; }

    // Every message of the registered names so far, in their order.
    const std::vector<Received>& received() const { return received_; }
    // Those of one code.
    std::vector<Received> received(WPARAM code) const;
    void forgetReceived() { received_.clear(); }

    // Called with each message before it is answered or handed on, so that a test can call back into the
    // editor from it.
    std::function<void(const Received&)> onMessage;

    LRESULT WindowProc(UINT message, WPARAM wParam, LPARAM lParam) override;

private:
    void record(UINT message, WPARAM code, const CKHComm_Package* package);
    LRESULT answer(WPARAM code);

    Project project_;
    std::vector<Received> received_;
};

} // namespace kota::headless
