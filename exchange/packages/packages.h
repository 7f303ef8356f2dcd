#pragma once

#include "exchange/packages/export.h"
#include "platform/framework/list.h"
#include "platform/framework/text.h"
#include "platform/framework/types.h"

#include <cstdint>

class CView;

// What travels between the editors and the shell: objects in one address space, so sender and receiver are
// built on this header. A package lives on its sender's stack for one SendMessage: a receiver keeps neither
// the package nor what it points to.

// The base of everything that travels.
class KOTA_PACKAGES_API CKhCBEItem : public CObject {
public:
    CKhCBEItem();
    ~CKhCBEItem() override;
};

// What a located item stands for, in CK31_CBE_ModelDataItem::dataType.
enum class DataType : std::int32_t {
    Init = 0,
    Sediment = 1,
    NonCohesive = 2,
    Layer = 3,
    Decay = 4,
    Dispersion = 5,
    IceData = 6,
    Boundary = 7,
};

// A location of one kind of data. A receiver leaves an item to its sender, but for the answers to the codes
// OfferRivers and OfferLocation, which the asking editor deletes.
class KOTA_PACKAGES_API CK31_CBE_ModelDataItem : public CKhCBEItem {
public:
    CK31_CBE_ModelDataItem();
    ~CK31_CBE_ModelDataItem() override;

    CString riverName;         // UTF-8
    double chainage = 0.0;     // m
    double chainage2 = 0.0;    // m
    std::int32_t dataType = 0; // a DataType
    CString secondText;        // empty in what this editor sends
    std::int32_t flag = 0;     // 0 in what this editor sends
};

// The kind of every package that this editor sends.
inline constexpr std::int32_t parameterPackage = 5;

// The envelope of a message between editors and shell.
class KOTA_PACKAGES_API CKHComm_Package : public CKhCBEItem {
public:
    CKHComm_Package();
    ~CKHComm_Package() override;

    CView* sender = nullptr; // null in some requests
    CString documentName;    // the title of the sending document
    std::int32_t packageKind = parameterPackage;
    std::intptr_t project = 0; // the handle that the shell gave, 0 for none
    CObject* items = nullptr;  // a CObList of items or, for LocationChanged, a single item; the sender's
};

// wParam of "KOTAHubCommunicationBetweenEditors". lParam is a package, which must not be kept.
namespace CommunicationCode {
inline constexpr WPARAM GetData = 42;    // to a view: a sibling asks for the data list
inline constexpr WPARAM InsertData = 62; // to a view: a sibling inserts items[0]
inline constexpr WPARAM DeleteData = 82; // to a view: a sibling deletes items[0]
// To the main window: `items` is the place of the current line, a single item of the sender's; no package
// (lParam 0) when the view goes away.
inline constexpr WPARAM LocationChanged = 503;
// To the main window: the data of the document `documentName` changed. The package has neither sender nor
// items.
inline constexpr WPARAM DataChanged = 523;

// Whether a shell that gets the code hands it on to the views of all editors, by the same message. Of a
// document outside a project, neither is sent but for LocationChanged without a package.
constexpr bool isToldToAll(WPARAM code) {
    return code == LocationChanged || code == DataChanged;
}
} // namespace CommunicationCode

// wParam of "KOTAHubSwitchBoardSevice", to the main window. The answer is the result of SendMessage.
namespace SwitchBoardCode {
inline constexpr WPARAM LeaveProject = 24;   // no answer
inline constexpr WPARAM JoinProject = 25;    // the project's handle, or 0
inline constexpr WPARAM OfferRivers = 52;    // a new CObList of new items, the name in riverName, or null
inline constexpr WPARAM OfferLocation = 200; // a new item, or null
} // namespace SwitchBoardCode

// wParam of the tool bar messages: the tool bar's first command.
inline constexpr WPARAM toolbarCommand = 42550;
// wParam of "KOTAHubProjectManagement" that a view hands on; it swallows all others.
inline constexpr WPARAM projectPassedOn = 2;

// The registered messages' numbers.
KOTA_PACKAGES_API UINT communicationMessage(); // "KOTAHubCommunicationBetweenEditors"
KOTA_PACKAGES_API UINT switchBoardMessage();   // "KOTAHubSwitchBoardSevice"
KOTA_PACKAGES_API UINT projectMessage();       // "KOTAHubProjectManagement", to a view
KOTA_PACKAGES_API UINT showToolbarMessage();   // "KOTAHubShowToolbar", to the main window
KOTA_PACKAGES_API UINT hideToolbarMessage();   // "KOTAHubHideToolbar", to the main window
