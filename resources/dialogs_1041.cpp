#include "resources/dialog_trees.h"
#include "resources/texts.h"

namespace {

constexpr DialogTexts japanese{
    .components = "成分",
    .dispersion = "分散",
    .decay = "減衰",
    .boundary = "境界",
    .initialConditions = "初期条件",
    .cohesive = "粘着性土砂",
    .nonCohesive = "非粘着性土砂",
    .sedimentLayers = "底質層",
    .additionalOutput = "追加出力",
    .k32AdditionalOutput = "KOTA 32 追加出力",
    .k32Boundary = "KOTA 32 境界",
    .k32Dispersion = "KOTA 32 分散",
    .search = "検索",
    .gotoLine = "行へ移動",
    .decayConstants = "減衰定数",
    .dispersionCoefficients = "分散係数/分散因子",
    .globalValues = "全域値",
    .localValues = "局所値",
    .dispersionFactor = "分散因子",
    .exponent = "指数",
    .minimumDispersion = "最小分散係数",
    .maximumDispersion = "最大分散係数",
    .notAvailableYet = "このページはまだ利用できません。",
    .componentNumber = "成分番号:",
    .riverName = "河川名:",
    .partialMatch = "部分一致",
    .fullMatch = "完全一致",
    .chainage = "追加距離:",
    .chainageNotUsed = "使用しない",
    .lineNumber = "行番号:",
    .ok = "OK",
    .cancel = "キャンセル",
};

} // namespace

std::span<const kota::DialogTemplate> japaneseDialogs() {
    return DialogTrees<japanese>::all;
}
