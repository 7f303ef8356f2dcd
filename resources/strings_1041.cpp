#include "resources/ids.h"
#include "resources/texts.h"

namespace {

constexpr kota::StringResource strings[] = {
    {StringId::ConcentrationUnits, "my-g/m3\nmg/m3\ng/m3\nkg/m3\nmy-g/l\nmg/l\ng/l\n℃\n"
                                   "100万/100 ml\nPSU\n千分率"},
    {StringId::ComponentKinds, "通常\n単層粘着性\n多層粘着性"},
    {StringId::AcceleratorName, "AD パラメータ"},
    {StringId::DocTemplate, "K31_Help.chm\nADPar\nKOTA 31 AD パラメータ\nKOTA 31 AD パラメータ (*.ad31)\n"
                            ".ad31\nADPar.Document\nADPar Document"},
    {StringId::UndefinedChoice, "未定義\r\n"},
    {StringId::UndefinedEntry, "未定義\n"},
    {StringId::HeadDispersionFactor, "分散因子"},
    {StringId::HeadExponent, "指数"},
    {StringId::HeadMinimumCoef, "最小係数"},
    {StringId::HeadMaximumCoef, "最大係数"},
    {StringId::MaximumBelowMinimum, "最大分散係数は最小分散係数より大きくなければなりません。"},
    {StringId::SedimentGlobalsMissing, "粘着性土砂ページで成分 %s の全域値が指定されていません。"},
    {StringId::NonCohesiveGlobalsMissing, "非粘着性土砂ページで成分 %s の全域値が指定されていません。"},
    {StringId::UnsupportedFileFormat, "対応していないファイル形式です"},
    {StringId::InvalidValue, "浮動小数点数として正しくない値です!"},
    {StringId::ErrorInChainage, "追加距離に誤りがあります (浮動小数点数ではありません)"},
    {StringId::DeletedBehindError + 0, "底質層ページのデータを削除しました。そのページに切り替えるには、まず"
                                       "現在のページの誤りを修正してください"},
    {StringId::DeletedBehindError + 1, "初期条件ページのデータを削除しました。そのページに切り替えるには、ま"
                                       "ず現在のページの誤りを修正してください"},
    {StringId::DeletedBehindError + 2, "土砂ページのデータを削除しました。そのページに切り替えるには、まず現"
                                       "在のページの誤りを修正してください"},
    {StringId::DeletedBehindError + 3, "非粘着性土砂ページのデータを削除しました。そのページに切り替えるには"
                                       "、まず現在のページの誤りを修正してください"},
    {StringId::DeletedBehindError + 4, "減衰ページのデータを削除しました。そのページに切り替えるには、まず現"
                                       "在のページの誤りを修正してください"},
    {StringId::DeletedBehindError + 5, "分散ページのデータを削除しました。そのページに切り替えるには、まず現"
                                       "在のページの誤りを修正してください"},
    {StringId::DeletedBehindError + 6, "結氷データページのデータを削除しました。そのページに切り替えるには、"
                                       "まず現在のページの誤りを修正してください"},
    {StringId::DeletedBehindError + 7, "境界ページのデータを削除しました。そのページに切り替えるには、まず現"
                                       "在のページの誤りを修正してください"},
    {StringId::InsertedBehindError + 0, "初期条件ページにデータを挿入しました。そのページに切り替えるには、ま"
                                        "ず現在のページの誤りを修正してください"},
    {StringId::InsertedBehindError + 1, "土砂ページにデータを挿入しました。そのページに切り替えるには、まず現"
                                        "在のページの誤りを修正してください"},
    {StringId::InsertedBehindError + 2, "非粘着性土砂ページにデータを挿入しました。そのページに切り替えるには"
                                        "、まず現在のページの誤りを修正してください"},
    {StringId::InsertedBehindError + 3, "減衰ページにデータを挿入しました。そのページに切り替えるには、まず現"
                                        "在のページの誤りを修正してください"},
    {StringId::InsertedBehindError + 4, "分散ページにデータを挿入しました。そのページに切り替えるには、まず現"
                                        "在のページの誤りを修正してください"},
    {StringId::InsertedBehindError + 5, "結氷データページにデータを挿入しました。そのページに切り替えるには、"
                                        "まず現在のページの誤りを修正してください"},
    {StringId::InsertedBehindError + 6, "境界ページにデータを挿入しました。そのページに切り替えるには、まず現"
                                        "在のページの誤りを修正してください"},
    {StringId::CannotSelect + 0, "現在のページに誤りがあるため、底質層ページを選択できません"},
    {StringId::CannotSelect + 1, "現在のページに誤りがあるため、初期条件ページを選択できません"},
    {StringId::CannotSelect + 2, "現在のページに誤りがあるため、土砂ページを選択できません"},
    {StringId::CannotSelect + 3, "現在のページに誤りがあるため、非粘着性土砂ページを選択できません"},
    {StringId::CannotSelect + 4, "現在のページに誤りがあるため、減衰ページを選択できません"},
    {StringId::CannotSelect + 5, "現在のページに誤りがあるため、分散ページを選択できません"},
    {StringId::CannotSelect + 6, "現在のページに誤りがあるため、結氷データページを選択できません"},
    {StringId::CannotSelect + 7, "現在のページに誤りがあるため、境界ページを選択できません"},
    {StringId::EditorName, "AD パラメータ"},
    {StringId::ToolbarName, " KOTA 31 AD ツール"},
    {StringId::SheetCaption, "Kota0 AD"},
    {StringId::ApplicationTitle, "Kota0_AD"},
    {StringId::ProbeRiver, "SDFG"},
    {StringId::IntegerBetween, "%d から %d までの整数を入力してください"},
    {StringId::SearchPrompt, "河川名/トポ ID を検索します。\n検索"},
    {StringId::FindNextPrompt, "河川名/トポ ID の次の一致箇所を検索します。\n次を検索"},
    {StringId::InsertLinePrompt, "局所値のグリッドに行を挿入します。"},
    {StringId::DeleteLinePrompt, "グリッドから行を削除します。"},
    {StringId::GotoLinePrompt, "指定した番号の行へ移動します。"},
    {StringId::InsertProbePrompt, "テスト"},
    {StringId::HeadComponent, "成分"},
    {StringId::HeadUnits, "単位"},
    {StringId::HeadType, "種類"},
    {StringId::HeadDecayConstant, "減衰定数 t-1"},
    {StringId::HeadGlobal, "全域"},
    {StringId::HeadRiverName, "河川名"},
    {StringId::HeadChainage, "追加距離"},
    {StringId::DoubleRequired, "実数を入力してください"},
    {StringId::InvalidNumber, "浮動小数点数として正しくありません!"},
    {StringId::NotFound, "検索項目が見つかりません"},
    {StringId::LastAlreadyFound, "検索項目の最後の一致箇所はすでに見つかっています"},
    {StringId::LineNumberTooSmall, "行番号は 0 より大きくなければなりません"},
    {StringId::IncompleteLines,
     "エディターの表で、何も入力されていない行、または一部しか\n入力されていない行は、"
     "ファイルの保存時に削除されます。\n続行しますか (はい/いいえ)?"},
    {StringId::HeadIceThickness, "氷厚"},
    {StringId::HeadIceWidth, "結氷幅"},
    {StringId::HeadIceQuality, "氷質"},
};

} // namespace

std::span<const kota::StringResource> japaneseStrings() {
    return strings;
}
