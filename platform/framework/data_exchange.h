#pragma once

#include "platform/framework/window.h"

// One run of a dialog's data exchange: from the controls into the dialog's members, or back.
struct CDataExchange {
    CWnd* dialog = nullptr;
    bool saveAndValidate = false; // true: from the controls into the members
};

// Each exchanges the control `id` of the dialog with a member. A control that is not there is left out.

// Gives the control to an object, the first time.
KOTA_API void DDX_Control(CDataExchange* exchange, UINT id, CWnd& control);
KOTA_API void DDX_Text(CDataExchange* exchange, UINT id, CString& value);
// A text that is no int, with nothing around it, is told to the user and ends the exchange (UpdateData gives
// 0).
KOTA_API void DDX_Text(CDataExchange* exchange, UINT id, int& value);
KOTA_API void DDX_Check(CDataExchange* exchange, UINT id, int& value);
// `id` is the first button of a group; the value is the place of the checked one from 0, -1 for none.
KOTA_API void DDX_Radio(CDataExchange* exchange, UINT id, int& value);
KOTA_API void DDX_CBIndex(CDataExchange* exchange, UINT id, int& index);

namespace kota {

// A control's text could not be taken over; ends the data exchange.
struct ExchangeFailure {};

} // namespace kota
