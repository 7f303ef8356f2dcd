#pragma once

#include "platform/framework/messages.h"
#include "platform/framework/screen.h"
#include "platform/framework/turn.h"
#include "platform/grid/grid.h"
#include "platform/grid/user.h"

#include <gmock/gmock.h>

#include <functional>
#include <memory>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

// A screen that writes down what it is told.
class NotingScreen : public kota::Screen {
public:
    NotingScreen() : before_(kota::attachScreen(this)) {}
    ~NotingScreen() override {
        kota::tellScreen();
        kota::attachScreen(before_);
    }

    int showMessageBox(const kota::MessageBoxRequest& request) override {
        boxes.emplace_back(request.text.View());
        return 1;
    }
    std::optional<CString> askSaveName(const CString&) override { return std::nullopt; }
    void showDialog(CDialog&) override { ADD_FAILURE() << "a dialog was shown"; }
    void windowsChanged(std::span<const kota::WindowChange> changes) override {
        for (const kota::WindowChange& change : changes)
            if (change.has(kota::Change::Contents))
                contents.push_back(change.window);
    }

    std::vector<std::string> boxes;
    std::vector<HWND> contents; // the windows whose contents changed, once for each telling

private:
    kota::Screen* before_;
};

// Text that may not hold "bad".
class CheckedEdit : public CGXEditControl {
public:
    explicit CheckedEdit(CGXGridCore* grid) : CGXEditControl(grid, 7) {}

    BOOL OnValidate() override {
        ++validations;
        validated = {Row(), Col()};
        const bool bad = GetCurrentText().View().find("bad") != std::string_view::npos;
        if (onValidate)
            onValidate();
        if (bad)
            Grid()->SetWarningText("No bad text");
        return !bad;
    }
    BOOL GetValue(CString& value) override {
        value = GetCurrentText() + tail;
        return TRUE;
    }
    bool TakeText(const char* text) override {
        if (onTake)
            onTake();
        return CGXEditControl::TakeText(text);
    }

    std::function<void()> onValidate;
    std::function<void()> onTake;
    CString tail; // stands behind what is typed when it is stored
    std::pair<ROWCOL, ROWCOL> validated;
    int validations = 0;
};

// A grid that writes down which of its operations were called. By column: 1 checked text, 2 choice from 0,
// 3 check box, 4 choice from 1, 5 free text with proposals.
class TestGrid : public CGXGridWnd {
public:
    static constexpr UINT checkedEdit = 4788;
    static constexpr ROWCOL textCol = 1;
    static constexpr ROWCOL choiceCol = 2;
    static constexpr ROWCOL checkCol = 3;
    static constexpr ROWCOL choiceFromOneCol = 4;
    static constexpr ROWCOL freeCol = 5;

    explicit TestGrid(ROWCOL lines = 4) {
        Create({.kind = kota::WindowKind::Grid});
        Initialize();
        auto control = std::make_unique<CheckedEdit>(this);
        edit = control.get();
        RegisterControl(checkedEdit, std::move(control));
        SetColCount(5);
        SetRowCount(lines);
        const auto column = [this](ROWCOL col, UINT id, const char* choices) {
            SetStyleRange(CGXRange().SetCols(col), CGXStyle().SetControl(id).SetChoiceList(choices));
        };
        column(textCol, checkedEdit, "");
        column(choiceCol, GX_IDS_CTRL_ZEROBASED_EX, "Closed\r\nOpen\r\nOpen, twice\r\n");
        column(checkCol, GX_IDS_CTRL_CHECKBOX, "");
        column(choiceFromOneCol, GX_IDS_CTRL_ONEBASED_EX, "mg\nkg");
        column(freeCol, GX_IDS_CTRL_TEXTFIT, "MISSOURI\nOHIO\n");
    }

    BOOL SetCurrentCell(ROWCOL row, ROWCOL col, UINT flags = GX_SCROLLINVIEW) override {
        note("SetCurrentCell", row, col, " " + std::to_string(flags));
        const BOOL result = CGXGridWnd::SetCurrentCell(row, col, flags);
        if (afterSetCurrent)
            afterSetCurrent();
        return result;
    }
    BOOL OnStartEditing(ROWCOL row, ROWCOL col) override {
        note("OnStartEditing", row, col);
        return onStart ? onStart(row, col) : CGXGridWnd::OnStartEditing(row, col);
    }
    void OnModifyCell(ROWCOL row, ROWCOL col) override {
        note("OnModifyCell", row, col);
        CGXGridWnd::OnModifyCell(row, col);
        if (onModify)
            onModify(row, col);
    }
    void OnClickedButtonRowCol(ROWCOL row, ROWCOL col) override {
        note("OnClickedButtonRowCol", row, col, " " + text(row, col));
    }
    void OnChangedSelection() override {
        calls.emplace_back("OnChangedSelection");
        if (onSelection)
            onSelection();
    }
    void OnActivateGrid(BOOL active) override {
        if (onActivate)
            onActivate(active != 0);
    }

    std::string text(ROWCOL row, ROWCOL col) const { return std::string(CellText(row, col)); }
    std::string shown(ROWCOL row, ROWCOL col) const { return std::string(GetDisplayText(row, col).View()); }
    void write(ROWCOL row, ROWCOL col, const char* value) { SetValueRange(CGXRange(row, col), value); }
    // "row,col" of the current cell, "none" without one.
    std::string current() const {
        ROWCOL row = 9;
        ROWCOL col = 9;
        const bool there = GetCurrentCell(&row, &col) != 0;
        const std::string place = std::to_string(row) + "," + std::to_string(col);
        return there ? place : place == "0,0" ? "none" : "none but " + place;
    }
    // Makes the cell current as a program does, without a trace in `calls`.
    void goTo(ROWCOL row, ROWCOL col) {
        SetCurrentCell(row, col, GX_KEEPFOCUS);
        calls.clear();
    }
    // The selected ranges as "rows 1-2 cells 1,1-2,3".
    std::string selected() const {
        std::string all;
        for (const CGXRange& range : GetParam()->GetRangeList()->Ranges()) {
            const bool rows = range.kind == CGXRange::Kind::Rows;
            const auto place = [rows](ROWCOL row, ROWCOL col) {
                return std::to_string(row) + (rows ? "" : "," + std::to_string(col));
            };
            all += all.empty() ? "" : " ";
            all += (rows ? "rows " : "cells ") + place(range.top, range.left) + "-" +
                   place(range.bottom, range.right);
        }
        return all;
    }

    std::vector<std::string> calls;
    std::function<BOOL(ROWCOL, ROWCOL)> onStart;
    std::function<void(ROWCOL, ROWCOL)> onModify;
    std::function<void()> afterSetCurrent;
    std::function<void()> onSelection;
    std::function<void(bool)> onActivate;
    CheckedEdit* edit = nullptr;

private:
    void note(const char* operation, ROWCOL row, ROWCOL col, const std::string& tail = "") {
        calls.push_back(operation + (" " + std::to_string(row)) + " " + std::to_string(col) + tail);
    }
};
