#pragma once

#include "document/export.h"
#include "document/lists/record_lists.h"
#include "document/records/global_var.h"
#include "platform/foundation/kh_doc.h"

#include <array>
#include <cstdint>

class CView;

// The parameter document: all that an .ad31 file holds, in memory. Pages, the exchange and siblings read and
// write its members directly, in base units.
//
// Pages delete records and build them anew: a pointer to a record is good until something runs that a page
// may store in, as UpdateAllViews, a save, an input of the user or a message to the shell. Who changes
// records first has the pages take over what is being typed (TakePendingInput), and afterwards calls
// UpdateAll(nullptr, UpdateHint::Fill, nullptr) and DataChange.
//
// A document that a template made belongs to its views, which the user or the shell may close in any message.
// Whoever makes one without a template calls DeleteContents before it is deleted, which deletes the records.
// Arguments that are a CString by value serve callers built on the same SDK (kota::abiVersion).
class KOTA0_AD_API CKota0_adDoc : public CKhDoc {
    DECLARE_DYNCREATE(CKota0_adDoc)
public:
    CKota0_adDoc();
    ~CKota0_adDoc() override;

    void Serialize(CArchive& archive) override;
    // Deletes the records of all lists. The global values stay as they are.
    void DeleteContents() override;
    BOOL OnNewDocument() override;
    // 0 for a file that cannot be opened, and then the document is as it was; and for one whose extension is
    // neither ".ad31" nor ".AD31", and then filePath is set and the lists are empty. A file with a syntax
    // error opens as an empty document, after the user was told.
    BOOL OnOpenDocument(const char* path) override;
    // Lets the views store what they show, drops incomplete lines, and writes the file, its extension always
    // ".AD31". 0, with nothing written, when a sediment component has no global line.
    BOOL OnSaveDocument(const char* path) override;

    // Adds what the file holds to the document. A syntax error is told in a box and leaves the document
    // alone.
    void ReadData(const char* path);
    // Replaces the file by the document. A failure is in the file library's error state.
    void WriteData(const char* path);

    // The name of the component of that number, empty when there is none. The reference is good until the
    // components change.
    CString& GetCompName(int number);
    // The number (AD_Component::number) of the component of exactly that name, 0 when there is none.
    int GetCompNum(CString name);

    // Asks the shell for the project that the view's document belongs to, and keeps its handle. 1 in a
    // project, 0 not.
    int GetProjectInfo(CView* view, CString documentName);
    // Tells the shell that the view leaves the project. Outside a project nothing is sent.
    void LeaveProject(CView* view, CString documentName);
    // Tells the shell that the document's data changed (CommunicationCode::DataChanged); the name is the
    // document's title. Outside a project nothing is sent.
    void DataChange(CString documentName);
    // Marks the document as modified, updates all views but the sender by an UpdateHint, and gives the sender
    // the focus. Who has no view of the document sends null; the object may be null.
    void UpdateAll(CView* sender, int hint, CObject* hintObject);

    CString filePath; // as last opened
    AD_Global_Var globalVar;
    CInitList initList;
    CInitStraList initStraList;
    CNonCohesList nonCohesList;
    CDecayList decayList;
    CDispersList dispersList;
    CK32DispersList k32DispersList;
    CIceDataList iceDataList;
    CGlobalList globalList;
    CCompList compList;
    CBoundList boundList;
    CK32BoundList k32BoundList;
    CLayerList layerList;
    std::intptr_t projectHandle = 0; // 0: in no project
    CString emptyName;               // what GetCompName gives for no component; never changed

protected:
    CString WrittenPathName(const char* path) const override;

private:
    std::array<CGenList*, 12> AllLists();
    std::array<CGenList*, 10> SavedLists();
};

// What the document tells its views by a hint of UpdateAllViews.
namespace UpdateHint {
inline constexpr LPARAM Store = 1; // write what is shown back into the document
inline constexpr LPARAM Fill = 2;  // show the document anew
} // namespace UpdateHint
