#include "hub/project/project_texts.h"

#include "platform/framework/module.h"
#include "platform/language/language.h"

#include <iterator>

namespace kota::hub {

namespace {

constexpr UINT id(ProjectText text) {
    return static_cast<UINT>(text);
}

constexpr StringResource english[] = {
    {id(ProjectText::FileNotReadable), "%1: the file cannot be read: %2"},
    {id(ProjectText::NotJson), "%1:%2:%3: valid JSON was expected (%4)"},
    {id(ProjectText::Misfit), "%1: %2 was expected, and %3 stands there"},
    {id(ProjectText::Within), "%1: %2"},
    {id(ProjectText::Feature), "feature %1"},
    {id(ProjectText::NamedFeature), "feature %1 (%2)"},
    {id(ProjectText::AnObject), "an object"},
    {id(ProjectText::AList), "a list"},
    {id(ProjectText::AFeature), "a list of at least one feature"},
    {id(ProjectText::TwoPlaces), "a list of at least two coordinates"},
    {id(ProjectText::ALineOrMore), "a list of at least one line"},
    {id(ProjectText::ACollectionOrFeature), "FeatureCollection or Feature"},
    {id(ProjectText::ALine), "LineString or MultiLineString"},
    {id(ProjectText::AText), "a text"},
    {id(ProjectText::ANumber), "a number"},
    {id(ProjectText::ANumberInRange), "a number from -1e9 to 1e9"},
    {id(ProjectText::ALongitude), "a longitude from -360 to 360"},
    {id(ProjectText::ALatitude), "a latitude from -90 to 90"},
    {id(ProjectText::AChainageInSpan), "a chainage from chainage_start to chainage_end"},
    {id(ProjectText::AChainageInOrder), "a chainage in the order of the places along the line"},
    {id(ProjectText::Nothing), "nothing"},
    {id(ProjectText::SomeObject), "an object"},
    {id(ProjectText::SomeList), "a list"},
    {id(ProjectText::AnEmptyList), "an empty list"},
    {id(ProjectText::QuotedText), "'%1'"},
    {id(ProjectText::MapName), "River map"},
    {id(ProjectText::EmptyMap), "No river network is open.\nOpen a GeoJSON file of rivers to see them here."},
    {id(ProjectText::Place), "%1 %2"},
    {id(ProjectText::Metres), "%1 m"},
};
static_assert(std::size(english) == id(ProjectText::Count_), "a row for each text");

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
    const CString found = module().string(id(text));
    return QString::fromUtf8(found.View().data(), static_cast<qsizetype>(found.View().size()));
}

} // namespace kota::hub
