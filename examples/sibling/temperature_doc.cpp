#include "temperature_doc.h"

#include "decay.h"
#include "module.h"
#include "platform/framework/application.h"
#include "platform/framework/message_box.h"
#include "platform/framework/template.h"
#include "platform/kvs/kvs.h"

#include <filesystem>
#include <fstream>

namespace {

constexpr const char* targetName = "WATER_TEMPERATURE";
constexpr const char* sectionName = "Run";

void* parameter(void* section, const char* keyword) {
    return kvsParamByNum(kvsKeywordByNameNum(section, keyword, 1), 1);
}

} // namespace

IMPLEMENT_DYNCREATE(CTemperatureDoc, CKhDoc, temperatureModule)

void CTemperatureDoc::DeleteContents() {
    adName.Empty();
    component.Empty();
    temperature = 20.0;
    CKhDoc::DeleteContents();
}

BOOL CTemperatureDoc::OnOpenDocument(const char* path) {
    if (!CKhDoc::OnOpenDocument(path))
        return FALSE;
    void* file = kvsLoadFile(path, 1);
    if (kvsGetErrorGlb()) {
        CString problem;
        kvsGetSyntaxErr(file, nullptr, nullptr, &problem);
        kvsClose(&file);
        AfxMessageBox(problem);
        return FALSE;
    }
    void* const run = kvsSectionByNameNum(kvsTargetByNameNum(file, targetName, 1), sectionName, 1);
    adName = kvsGetString(parameter(run, "Document"));
    component = kvsGetString(parameter(run, "Component"));
    temperature = kvsGetDouble(parameter(run, "Temperature"));
    kvsClose(&file);
    return TRUE;
}

BOOL CTemperatureDoc::OnSaveDocument(const char* path) {
    void* file = kvsCreate();
    kvsAddTarget(file, targetName);
    kvsAddSection(file, sectionName);
    kvsAddKeyword(file, "Document");
    kvsAddString(file, adName.View());
    kvsAddKeyword(file, "Component");
    kvsAddString(file, component.View());
    kvsAddKeyword(file, "Temperature");
    kvsAddDouble(file, temperature);
    std::ofstream(path, std::ios::trunc).close(); // the file library appends
    const bool written = kvsAppend(file, path) != 0;
    kvsClose(&file);
    if (written)
        SetModifiedFlag(FALSE);
    return written;
}

CString CTemperatureDoc::AdPath() const {
    const auto folder = std::filesystem::path(GetPathName().View()).parent_path();
    return (folder / adName.View()).c_str();
}

CKota0_adDoc* CTemperatureDoc::FindAdDocument() const {
    for (const CDocTemplate* known : AfxGetApp()->Templates()) {
        CDocument* const open = known->FindOpen(AdPath());
        if (open && open->IsKindOf(RUNTIME_CLASS(CKota0_adDoc)))
            return static_cast<CKota0_adDoc*>(open);
    }
    return nullptr;
}

CKota0_adDoc* CTemperatureDoc::OpenAdDocument() const {
    CDocument* const opened = AfxGetApp()->OpenDocumentFile(AdPath());
    return opened && opened->IsKindOf(RUNTIME_CLASS(CKota0_adDoc)) ? static_cast<CKota0_adDoc*>(opened)
                                                                   : nullptr;
}

bool CTemperatureDoc::Correct(double wanted) {
    CKota0_adDoc* const ad = FindAdDocument();
    if (!ad || !ad->TakePendingInput())
        return false;
    water::multiplyDecay(*ad, component, water::decayFactor(temperature, wanted));
    temperature = wanted;
    SetModifiedFlag();
    ad->UpdateAll(nullptr, UpdateHint::Fill, nullptr);
    ad->DataChange(ad->GetTitle());
    return true;
}

bool CTemperatureDoc::SaveBoth() {
    CKota0_adDoc* const ad = FindAdDocument();
    if (!ad || !ad->DoSave(ad->GetPathName()))
        return false;
    // It is written as .AD31, and bears the name of what was written.
    const auto folder = std::filesystem::path(GetPathName().View()).parent_path();
    adName = std::filesystem::path(ad->GetPathName().View()).lexically_proximate(folder).c_str();
    return DoSave(GetPathName()) != 0;
}
