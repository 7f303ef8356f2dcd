#include "exchange/packages/packages.h"

#include "platform/framework/window.h"

CKhCBEItem::CKhCBEItem() = default;
CKhCBEItem::~CKhCBEItem() = default;

CK31_CBE_ModelDataItem::CK31_CBE_ModelDataItem() = default;
CK31_CBE_ModelDataItem::~CK31_CBE_ModelDataItem() = default;

CKHComm_Package::CKHComm_Package() = default;
CKHComm_Package::~CKHComm_Package() = default;

UINT communicationMessage() {
    return RegisterWindowMessage("KOTAHubCommunicationBetweenEditors");
}
UINT switchBoardMessage() {
    return RegisterWindowMessage("KOTAHubSwitchBoardSevice");
}
UINT projectMessage() {
    return RegisterWindowMessage("KOTAHubProjectManagement");
}
UINT showToolbarMessage() {
    return RegisterWindowMessage("KOTAHubShowToolbar");
}
UINT hideToolbarMessage() {
    return RegisterWindowMessage("KOTAHubHideToolbar");
}
