#include "document/kota0_ad_doc.h"

#include "document/records/component.h"
#include "exchange/packages/packages.h"
#include "platform/framework/application.h"
#include "platform/framework/message_box.h"
#include "platform/framework/path.h"
#include "platform/framework/view.h"
#include "platform/kvs/kvs.h"
#include "resources/ids.h"
#include "resources/module.h"

#include <cstdio>
#include <utility>

namespace {

constexpr const char* targetName = "KOTA0_AD";
constexpr const char* writtenExtension = ".AD31";
constexpr const char* lowerCaseExtension = ".ad31";

LRESULT sendToShell(UINT message, WPARAM code, CKHComm_Package& package) {
    CWnd* mainWindow = AfxGetMainWnd();
    return mainWindow ? mainWindow->SendMessage(message, code, reinterpret_cast<LPARAM>(&package)) : 0;
}

} // namespace

IMPLEMENT_DYNCREATE(CKota0_adDoc, CKhDoc, kota0AdModule)

CKota0_adDoc::CKota0_adDoc() = default;
CKota0_adDoc::~CKota0_adDoc() = default;

// The lists in the order in which the document cleans them.
std::array<CGenList*, 12> CKota0_adDoc::AllLists() {
    return {&initList,    &initStraList, &nonCohesList, &decayList, &dispersList,  &k32DispersList,
            &iceDataList, &globalList,   &compList,     &boundList, &k32BoundList, &layerList};
}

// The lists that the file holds, in file order: a boundary lives only while the document is open.
std::array<CGenList*, 10> CKota0_adDoc::SavedLists() {
    return {&initList,    &initStraList, &nonCohesList, &decayList, &dispersList,
            &iceDataList, &globalList,   &compList,     &layerList, &k32DispersList};
}

void CKota0_adDoc::Serialize(CArchive& /*archive*/) {}

void CKota0_adDoc::DeleteContents() {
    for (CGenList* list : AllLists())
        list->DeleteAll();
    CKhDoc::DeleteContents();
}

BOOL CKota0_adDoc::OnNewDocument() {
    return CKhDoc::OnNewDocument() ? TRUE : FALSE;
}

BOOL CKota0_adDoc::OnOpenDocument(const char* path) {
    if (!CKhDoc::OnOpenDocument(path))
        return FALSE;
    filePath = path;
    const CString extension = SplitPath(filePath).extension;
    if (extension != writtenExtension && extension != lowerCaseExtension) {
        MessageBox(nullptr, kota0AdModule().string(StringId::UnsupportedFileFormat), nullptr, MB_OK);
        return FALSE;
    }
    ReadData(filePath);
    return TRUE;
}

BOOL CKota0_adDoc::OnSaveDocument(const char* path) {
    // An edit that has the focus commits what was typed into it.
    if (CWnd* mainWindow = AfxGetThread() ? AfxGetThread()->GetMainWnd() : nullptr)
        mainWindow->SetFocus();
    SetFocus(nullptr);

    const CString written = WrittenPathName(path);
    UpdateAllViews(nullptr, UpdateHint::Store);
    if (!nonCohesList.CheckGlobalsPresent(&compList) || !globalList.CheckGlobalsPresent(&compList))
        return FALSE;
    int changed = 0;
    for (CGenList* list : AllLists())
        if (!list->RemoveEmptyLines(&changed))
            return FALSE;
    UpdateAllViews(nullptr, UpdateHint::Fill);
    WriteData(written);
    SetModifiedFlag(FALSE);
    return TRUE;
}

CString CKota0_adDoc::WrittenPathName(const char* path) const {
    const PathParts parts = SplitPath(path);
    return parts.drive + parts.directory + parts.fileName + writtenExtension;
}

void CKota0_adDoc::ReadData(const char* path) {
    void* file = kvsLoadFile(path, 1);
    if (kvsPeekErrorGlb()) {
        kvsGetErrorGlb();
        int line = 0;
        int column = 0;
        CString text;
        kvsGetSyntaxErr(file, &line, &column, &text);
        MessageBox(nullptr, text, nullptr, MB_OK);
        kvsClose(&file);
        return;
    }
    void* const target = kvsTargetByNameNum(file, targetName, 1);
    globalVar.Load(target);
    for (CGenList* list : SavedLists())
        list->Load(target);
    kvsClose(&file);
}

void CKota0_adDoc::WriteData(const char* path) {
    if (std::FILE* truncated = std::fopen(path, "w"))
        std::fclose(truncated);
    void* file = kvsCreate();
    kvsAddTarget(file, targetName);
    globalVar.Save(file);
    for (CGenList* list : SavedLists())
        list->Save(file);
    kvsEndSection(file);
    kvsAppend(file, path);
    kvsClose(&file);
}

CString& CKota0_adDoc::GetCompName(int number) {
    for (POSITION position = compList.GetHeadPosition(); position;) {
        AD_Component* component = compList.NextRecord(position);
        if (component->number == number)
            return component->name;
    }
    return emptyName;
}

int CKota0_adDoc::GetCompNum(CString name) {
    for (POSITION position = compList.GetHeadPosition(); position;) {
        const AD_Component* component = compList.NextRecord(position);
        if (component->name == name)
            return component->number;
    }
    return 0;
}

int CKota0_adDoc::GetProjectInfo(CView* view, CString documentName) {
    CKHComm_Package package;
    package.sender = view;
    package.documentName = std::move(documentName);
    projectHandle = sendToShell(switchBoardMessage(), SwitchBoardCode::JoinProject, package);
    return projectHandle != 0 ? 1 : 0;
}

void CKota0_adDoc::LeaveProject(CView* view, CString documentName) {
    if (projectHandle == 0)
        return;
    CKHComm_Package package;
    package.sender = view;
    package.documentName = std::move(documentName);
    package.project = projectHandle;
    sendToShell(switchBoardMessage(), SwitchBoardCode::LeaveProject, package);
}

void CKota0_adDoc::DataChange(CString documentName) {
    if (projectHandle == 0)
        return;
    CKHComm_Package package;
    package.documentName = std::move(documentName);
    package.project = projectHandle;
    sendToShell(communicationMessage(), CommunicationCode::DataChanged, package);
}

void CKota0_adDoc::UpdateAll(CView* sender, int hint, CObject* hintObject) {
    // Another view may close the sender while it is updated.
    const HWND senderWindow = sender ? sender->GetSafeHwnd() : nullptr;
    SetModifiedFlag(TRUE);
    UpdateAllViews(sender, hint, hintObject);
    // The shell may have brought another document to the front meanwhile: the keys are that one's.
    const CWnd* const stillThere = CWnd::FromHandle(senderWindow);
    if (stillThere && stillThere->MayTakeFocus())
        SetFocus(senderWindow);
}
