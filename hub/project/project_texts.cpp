#include "hub/project/project_texts.h"

#include "platform/framework/module.h"
#include "platform/language/language.h"

#include <iterator>

namespace kota::hub {

namespace {

constexpr StringResource english[] = {
    {idOf(ProjectText::FileNotReadable), "%1: the file cannot be read: %2"},
    {idOf(ProjectText::NotJson), "%1:%2:%3: valid JSON was expected (%4)"},
    {idOf(ProjectText::Misfit), "%1: %2 was expected, and %3 stands there"},
    {idOf(ProjectText::Within), "%1: %2"},
    {idOf(ProjectText::Feature), "feature %1"},
    {idOf(ProjectText::NamedFeature), "feature %1 (%2)"},
    {idOf(ProjectText::AnObject), "an object"},
    {idOf(ProjectText::AList), "a list"},
    {idOf(ProjectText::AFeature), "a list of at least one feature"},
    {idOf(ProjectText::TwoPlaces), "a list of at least two coordinates"},
    {idOf(ProjectText::ALineOrMore), "a list of at least one line"},
    {idOf(ProjectText::ACollectionOrFeature), "FeatureCollection or Feature"},
    {idOf(ProjectText::ALine), "LineString or MultiLineString"},
    {idOf(ProjectText::AText), "a text"},
    {idOf(ProjectText::ANumber), "a number"},
    {idOf(ProjectText::ANumberInRange), "a number from -1e9 to 1e9"},
    {idOf(ProjectText::ALongitude), "a longitude from -360 to 360"},
    {idOf(ProjectText::ALatitude), "a latitude from -90 to 90"},
    {idOf(ProjectText::AChainageInSpan), "a chainage from chainage_start to chainage_end"},
    {idOf(ProjectText::AChainageInOrder), "a chainage in the order of the places along the line"},
    {idOf(ProjectText::Nothing), "nothing"},
    {idOf(ProjectText::SomeObject), "an object"},
    {idOf(ProjectText::SomeList), "a list"},
    {idOf(ProjectText::AnEmptyList), "an empty list"},
    {idOf(ProjectText::QuotedText), "'%1'"},
    {idOf(ProjectText::MapName), "River map"},
    {idOf(ProjectText::EmptyMap),
     "No river network is open.\nOpen a GeoJSON file of rivers to see them here."},
    {idOf(ProjectText::Place), "%1 %2"},
    {idOf(ProjectText::Metres), "%1 m"},
};
static_assert(std::size(english) == idOf(ProjectText::Count_), "a row for each text");

constinit AFX_EXTENSION_MODULE record;

const Module& module() {
    static const Module own("kota_project", {.strings = english}, &record);
    return own;
}

} // namespace

const Resources& englishProjectTexts() {
    static const Resources texts{.strings = english};
    return texts;
}

void loadProjectTexts() {
    KhLangLoadResDll("kota_project", &record.resources, 0);
}

QString projectText(ProjectText text) {
    const CString found = module().string(idOf(text));
    return QString::fromUtf8(found.View().data(), static_cast<qsizetype>(found.View().size()));
}

} // namespace kota::hub
