#pragma once

#include "platform/framework/module.h"
#include "platform/framework/window.h"

// How a bar looks and behaves, and the sides of a frame that it may be docked at.
inline constexpr UINT CBRS_TOOLTIPS = 0x10;
inline constexpr UINT CBRS_FLYBY = 0x20;
inline constexpr UINT CBRS_SIZE_DYNAMIC = 0x04;
inline constexpr UINT CBRS_ALIGN_ANY = 0xF000;

// A bar at a frame's side.
class KOTA_API CControlBar : public CWnd {
    DECLARE_DYNAMIC(CControlBar)
public:
    CControlBar();
    ~CControlBar() override;

    UINT GetBarStyle() const { return barStyle_; }
    void SetBarStyle(UINT style) { barStyle_ = style; }
    // The sides at which the user may dock the bar, of CBRS_ALIGN_ANY.
    void EnableDocking(UINT sides) { dockingSides_ = sides; }
    UINT DockingSides() const { return dockingSides_; }

private:
    UINT barStyle_ = 0;
    UINT dockingSides_ = 0;
};

// A bar of buttons.
class KOTA_API SECToolBar : public CControlBar {
    DECLARE_DYNAMIC(SECToolBar)
public:
    SECToolBar();
    ~SECToolBar() override;

    // Makes the bar's window inside `frame`. 0 without one, and when the bar has a window.
    BOOL Create(CWnd* frame, UINT style, UINT id);
};

// A tool bar whose buttons come from a module's resource.
class KOTA_API CKhFlatToolBar : public SECToolBar {
    DECLARE_DYNAMIC(CKhFlatToolBar)
public:
    CKhFlatToolBar();
    ~CKhFlatToolBar() override;

    // Takes the buttons of a module's tool bar. 0 when the module has no such tool bar.
    BOOL LoadToolBar(const kota::Module& module, UINT id);
    // Null before LoadToolBar.
    const kota::ToolBarTemplate* Buttons() const { return buttons_; }
    // Where the buttons' pictures and prompts are; null before LoadToolBar.
    const kota::Module* ResourceModule() const { return module_; }
    bool HasCommand(UINT command) const;

private:
    const kota::Module* module_ = nullptr;
    const kota::ToolBarTemplate* buttons_ = nullptr;
};

// The foundation's tool bar, which editors hand to the shell.
class KOTA_API CKhToolBarEx : public CKhFlatToolBar {
    DECLARE_DYNAMIC(CKhToolBarEx)
public:
    CKhToolBarEx();
    ~CKhToolBarEx() override;
};
