#include "hub/project/project_texts.h"

#include "platform/framework/module.h"

namespace {

using kota::hub::ProjectText;

constexpr kota::StringResource japanese[] = {
    {idOf(ProjectText::FileNotReadable), "%1: ファイルを読み込めません: %2"},
    {idOf(ProjectText::NotJson), "%1:%2:%3: 正しい JSON が必要です (%4)"},
    {idOf(ProjectText::Misfit), "%1: %2が必要ですが、実際は%3です"},
    {idOf(ProjectText::Within), "%1: %2"},
    {idOf(ProjectText::Feature), "地物 %1"},
    {idOf(ProjectText::NamedFeature), "地物 %1 (%2)"},
    {idOf(ProjectText::AnObject), "オブジェクト"},
    {idOf(ProjectText::AList), "リスト"},
    {idOf(ProjectText::AFeature), "1 つ以上の地物のリスト"},
    {idOf(ProjectText::TwoPlaces), "2 つ以上の座標のリスト"},
    {idOf(ProjectText::ALineOrMore), "1 つ以上の線のリスト"},
    {idOf(ProjectText::ACollectionOrFeature), " FeatureCollection または Feature "},
    {idOf(ProjectText::ALine), " LineString または MultiLineString "},
    {idOf(ProjectText::AText), "文字列"},
    {idOf(ProjectText::ANumber), "数値"},
    {idOf(ProjectText::ANumberInRange), " -1e9 から 1e9 までの数値"},
    {idOf(ProjectText::ALongitude), " -360 から 360 までの経度"},
    {idOf(ProjectText::ALatitude), " -90 から 90 までの緯度"},
    {idOf(ProjectText::AChainageInSpan), " chainage_start から chainage_end までの追加距離"},
    {idOf(ProjectText::AChainageInOrder), "線に沿った地点の順の追加距離"},
    {idOf(ProjectText::Nothing), "値なし"},
    {idOf(ProjectText::SomeObject), "オブジェクト"},
    {idOf(ProjectText::SomeList), "リスト"},
    {idOf(ProjectText::AnEmptyList), "空のリスト"},
    {idOf(ProjectText::QuotedText), "「%1」"},
    {idOf(ProjectText::MapName), "河川図"},
    {idOf(ProjectText::EmptyMap),
     "河川網が開かれていません。\n河川の GeoJSON ファイルを開くと、ここに表示されます。"},
    {idOf(ProjectText::Place), "%1 %2"},
    {idOf(ProjectText::Metres), "%1 m"},
};

} // namespace

// What the language library shows of itself; see kota::resourcesOf.
extern "C" KOTA_EXPORT const kota::Resources* KotaResources() {
    static const kota::Resources texts{.strings = japanese};
    return &texts;
}
