#include "hub/project/project_texts.h"

#include "platform/framework/module.h"

namespace {

using kota::hub::ProjectText;

constexpr UINT id(ProjectText text) {
    return static_cast<UINT>(text);
}

constexpr kota::StringResource japanese[] = {
    {id(ProjectText::FileNotReadable), "%1: ファイルを読み込めません: %2"},
    {id(ProjectText::NotJson), "%1:%2:%3: 正しい JSON が必要です (%4)"},
    {id(ProjectText::Misfit), "%1: %2が必要ですが、実際は%3です"},
    {id(ProjectText::Within), "%1: %2"},
    {id(ProjectText::Feature), "地物 %1"},
    {id(ProjectText::NamedFeature), "地物 %1 (%2)"},
    {id(ProjectText::AnObject), "オブジェクト"},
    {id(ProjectText::AList), "リスト"},
    {id(ProjectText::AFeature), "1 つ以上の地物のリスト"},
    {id(ProjectText::TwoPlaces), "2 つ以上の座標のリスト"},
    {id(ProjectText::ALineOrMore), "1 つ以上の線のリスト"},
    {id(ProjectText::ACollectionOrFeature), " FeatureCollection または Feature "},
    {id(ProjectText::ALine), " LineString または MultiLineString "},
    {id(ProjectText::AText), "文字列"},
    {id(ProjectText::ANumber), "数値"},
    {id(ProjectText::ANumberInRange), " -1e9 から 1e9 までの数値"},
    {id(ProjectText::ALongitude), " -360 から 360 までの経度"},
    {id(ProjectText::ALatitude), " -90 から 90 までの緯度"},
    {id(ProjectText::AChainageInSpan), " chainage_start から chainage_end までの追加距離"},
    {id(ProjectText::AChainageInOrder), "線に沿った地点の順の追加距離"},
    {id(ProjectText::Nothing), "値なし"},
    {id(ProjectText::SomeObject), "オブジェクト"},
    {id(ProjectText::SomeList), "リスト"},
    {id(ProjectText::AnEmptyList), "空のリスト"},
    {id(ProjectText::QuotedText), "「%1」"},
    {id(ProjectText::MapName), "河川図"},
    {id(ProjectText::EmptyMap),
     "河川網が開かれていません。\n河川の GeoJSON ファイルを開くと、ここに表示されます。"},
    {id(ProjectText::Place), "%1 %2"},
    {id(ProjectText::Metres), "%1 m"},
};

} // namespace

// What the language library shows of itself; see kota::resourcesOf.
extern "C" KOTA_EXPORT const kota::Resources* KotaResources() {
    static const kota::Resources texts{.strings = japanese};
    return &texts;
}
