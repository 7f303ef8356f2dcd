#include "temperature_view.h"

#include "decay.h"
#include "exchange/packages/packages.h"
#include "module.h"
#include "platform/framework/message_box.h"
#include "temperature_doc.h"

#include <charconv>
#include <optional>

namespace {

// The number that a text is; none for any other text.
std::optional<double> numberIn(const CString& text) {
    const char* const end = text.View().data() + text.View().size();
    double number = 0.0;
    const auto read = std::from_chars(text.View().data(), end, number);
    return read.ec == std::errc() && read.ptr == end ? std::optional(number) : std::nullopt;
}

} // namespace

IMPLEMENT_DYNCREATE(CTemperatureView, CFormView, temperatureModule)

CTemperatureView::CTemperatureView() : CFormView(Id::Form) {}

CTemperatureDoc& CTemperatureView::Document() const {
    return static_cast<CTemperatureDoc&>(*GetDocument());
}

void CTemperatureView::OnUpdate(CView* /*sender*/, LPARAM /*hint*/, CObject* /*hintObject*/) {
    CString temperature;
    temperature.Format("%g", Document().temperature);
    GetDlgItem(Id::AdName)->SetWindowText(Document().adName);
    GetDlgItem(Id::Component)->SetWindowText(Document().component);
    GetDlgItem(Id::Temperature)->SetWindowText(temperature);
    ShowDecay();
}

void CTemperatureView::OnActivateView(BOOL activate, CView* activateView, CView* deactiveView) {
    CFormView::OnActivateView(activate, activateView, deactiveView);
    if (activate)
        ShowDecay();
}

BOOL CTemperatureView::OnCmdMsg(UINT id, int notification) {
    static constexpr auto map = kota::commandMap<CTemperatureView>({
        {Id::AdName, EN_CHANGE, &CTemperatureView::OnAdNameTyped},
        {Id::Component, EN_CHANGE, &CTemperatureView::OnComponentTyped},
        {Id::OpenAdDocument, BN_CLICKED, &CTemperatureView::OnOpenAdDocument},
        {Id::Correct, BN_CLICKED, &CTemperatureView::OnCorrect},
        {Id::SaveBoth, BN_CLICKED, &CTemperatureView::OnSaveBoth},
    });
    return kota::runCommand(*this, map, id, notification) || CFormView::OnCmdMsg(id, notification);
}

LRESULT CTemperatureView::WindowProc(UINT message, WPARAM wParam, LPARAM lParam) {
    if (message == communicationMessage()) {
        Hear(wParam, reinterpret_cast<const CKHComm_Package*>(lParam));
        return 0;
    }
    return CFormView::WindowProc(message, wParam, lParam);
}

void CTemperatureView::Hear(WPARAM code, const CKHComm_Package* package) {
    if (code == CommunicationCode::LocationChanged && !package)
        GetDlgItem(Id::Place)->SetWindowText("");
    const CKota0_adDoc* const ad = Document().FindAdDocument();
    if (!ad || !package || !(package->documentName == ad->GetTitle()))
        return;
    if (code == CommunicationCode::DataChanged)
        ShowDecay();
    if (code == CommunicationCode::LocationChanged && package->items)
        ShowPlace(*ad, static_cast<const CK31_CBE_ModelDataItem&>(*package->items));
}

void CTemperatureView::ShowDecay() {
    const CKota0_adDoc* const ad = Document().FindAdDocument();
    CString text("The AD document is not open.");
    if (ad) {
        const water::DecaySummary decay = water::summaryOf(*ad, Document().component);
        text.Format("%d lines, %.4f to %.4f 1/h", decay.lines, decay.least, decay.most);
    }
    GetDlgItem(Id::Decay)->SetWindowText(text);
}

void CTemperatureView::ShowPlace(const CKota0_adDoc& ad, const CK31_CBE_ModelDataItem& place) {
    const auto decay = water::decayAt(ad, Document().component, place.riverName, place.chainage);
    CString text;
    text.Format("%s %.0f m: %.4f 1/h", static_cast<const char*>(place.riverName), place.chainage,
                decay.value_or(0.0));
    GetDlgItem(Id::Place)->SetWindowText(text);
}

bool CTemperatureView::Take(UINT id, CString& value) {
    const CString typed = GetDlgItem(id)->GetWindowText();
    if (typed == value)
        return false;
    value = typed;
    Document().SetModifiedFlag();
    return true;
}

void CTemperatureView::OnAdNameTyped() {
    if (Take(Id::AdName, Document().adName))
        ShowDecay();
}

void CTemperatureView::OnComponentTyped() {
    if (Take(Id::Component, Document().component))
        ShowDecay();
}

void CTemperatureView::OnOpenAdDocument() {
    Document().OpenAdDocument();
    ShowDecay();
}

void CTemperatureView::OnCorrect() {
    const std::optional<double> wanted = numberIn(GetDlgItem(Id::Temperature)->GetWindowText());
    if (!wanted)
        AfxMessageBox("The temperature must be a number.");
    else if (Document().Correct(*wanted))
        Document().UpdateAllViews(nullptr);
}

void CTemperatureView::OnSaveBoth() {
    if (Document().SaveBoth())
        Document().UpdateAllViews(nullptr);
}
