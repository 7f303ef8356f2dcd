#include "editing/base/grid_page.h"

#include "resources/module.h"

#include <algorithm>

IMPLEMENT_DYNAMIC(CGridPage, CGenPropertyPage, kota0AdModule)

namespace {

// What is done to a grid while one lives can not be undone, nor what was done before.
class WithoutUndo {
public:
    explicit WithoutUndo(CGenGrid& grid) : param_(*grid.GetParam()), before_(param_.IsUndoEnabled()) {
        param_.EnableUndo(FALSE);
    }
    ~WithoutUndo() { param_.EnableUndo(before_); }
    WithoutUndo(const WithoutUndo&) = delete;
    WithoutUndo& operator=(const WithoutUndo&) = delete;

private:
    CGXGridParam& param_;
    bool before_;
};

} // namespace

CGridPage::CGridPage(CKota0_adDoc* owner, UINT dialogId) : CGenPropertyPage(owner, dialogId) {}
CGridPage::~CGridPage() = default;

void CGridPage::AddPart(std::unique_ptr<GridPart> part) {
    parts_.push_back(std::move(part));
}

GridPart* CGridPage::ActivePart() {
    if (parts_.size() == 1)
        return parts_.front().get();
    const auto found = std::ranges::find_if(parts_, [&](const auto& part) {
        return static_cast<const CGenGrid*>(&part->Grid()) == GetActiveGrid();
    });
    return found == parts_.end() ? nullptr : found->get();
}

BOOL CGridPage::OnInitDialog() {
    CGenPropertyPage::OnInitDialog();
    for (const auto& part : parts_) {
        unitStyles.SetSize(part->Face().unitEntries);
        part->SetUp(*this);
    }
    FillFromDocument(Document());
    StoreToDocument();
    for (const auto& part : parts_)
        part->Grid().GetParam()->EnableUndo(TRUE);
    return TRUE;
}

BOOL CGridPage::OnKillActive() {
    if (!RepairBlanks())
        return FALSE;
    StoreToDocument();
    return MayBeLeft() && CGenPropertyPage::OnKillActive();
}

int CGridPage::RepairBlanks() {
    for (const auto& part : parts_)
        part->FillBlanks(Document()->globalVar);
    return 1;
}

bool CGridPage::MayBeLeft() {
    return true;
}

void CGridPage::InsertLocatedLine(CString riverName, CString chainage) {
    GridPart* const part = ActivePart();
    if (!part)
        return;
    part->AddLocatedLine(Document()->globalVar, riverName, chainage);
    part->Grid().SetCurrentCell(0, 0, GX_KEEPFOCUS);
}

void CGridPage::InsertDefaultLine() {
    if (GridPart* const part = ActivePart())
        part->AddDefaultLine(Document()->globalVar);
}

void CGridPage::DeleteCurrentLine() {
    GridPart* const part = ActivePart();
    if (!part)
        return;
    part->Grid().DeleteSelectedLines();
    if (part->Grid().GetRowCount() < part->Face().firstLine)
        InsertDefaultLine();
}

void CGridPage::GotoLine(unsigned line) {
    if (GridPart* const part = ActivePart())
        part->Grid().GotoGridLine(line);
}

void CGridPage::SearchLine(int noComponent, unsigned& line, unsigned component, CString text, double chainage,
                           int chainageTest, int textTest) {
    if (GridPart* const part = ActivePart())
        part->Grid().SearchNext(noComponent, line, component, std::move(text), chainage, chainageTest,
                                textTest);
}

void CGridPage::FillFromDocument(CKota0_adDoc* source) {
    CGenPropertyPage::FillFromDocument(source);
    for (const auto& part : parts_)
        if (part->Face().componentColumn != 0)
            part->SetComponentChoices(ComponentColumnChoices(part->Face().kindFilter));
    for (const auto& part : parts_) {
        const WithoutUndo scope(part->Grid());
        if (part->HasRecords(*source)) {
            part->FillLines(*source);
        } else {
            part->Grid().SetRowCount(part->Face().firstLine - 1);
            SetActiveGrid(&part->Grid());
            InsertDefaultLine();
        }
        part->Grid().RestoreCurrentCell(part->Face().firstLine);
    }
}

void CGridPage::StoreToDocument() {
    if (!IsInitialised()) // the document is the only truth
        return;
    for (const auto& part : parts_)
        part->StoreLines(*Document());
}

void CGridPage::SetRiverColumns() {
    for (const auto& part : parts_)
        part->SetRiverColumn();
}

void CGridPage::OnRowColumnChanged(ROWCOL row, ROWCOL col) {
    GridPart* const part = ActivePart();
    if (part && part->Face().globalColumn != 0)
        part->ApplyGlobalBox(row, col);
}
