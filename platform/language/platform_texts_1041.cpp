#include "platform/framework/platform_texts.h"

namespace {

using kota::PlatformText;

constexpr kota::StringResource japanese[] = {
    {idOf(PlatformText::InvalidArgument), "操作に無効な引数が渡されました (%s)。"},
    {idOf(PlatformText::NoHelp), "この項目のヘルプはありません。"},
    {idOf(PlatformText::NoPrinting), "印刷は利用できません。"},
    {idOf(PlatformText::IntegerRequired), "整数を入力してください。"},
    {idOf(PlatformText::SaveChanges), "%s への変更を保存しますか?"},
    {idOf(PlatformText::TheDocument), "文書"},
    {idOf(PlatformText::CannotOpen), "%s を開けません: %s。"},
    {idOf(PlatformText::SaveInterrupted),
     "%s は空です。保存が途中で中断されました。以前の版は %s にあります。"},
    {idOf(PlatformText::OpenElsewhere), "%s は別のウィンドウで開かれています。先にそちらを閉じてください。"},
    {idOf(PlatformText::ReplaceFile), "%s はすでに存在します。置き換えますか?"},
    {idOf(PlatformText::NotKept), "以前の版を残せないため、%s は保存されませんでした: %s。"},
    {idOf(PlatformText::NotSaved), "文書は保存されませんでした: %s。"},
    {idOf(PlatformText::NotAFile), "ファイルではありません"},
    {idOf(PlatformText::SomethingNotFile), "%s はファイルではありません"},
    {idOf(PlatformText::TooLarge), "4 GiB を超えています"},
    {idOf(PlatformText::NoMemoryToRead), "%s: 読み込むためのメモリが足りません"},
    {idOf(PlatformText::UnitOf), "単位: %s"},
    {idOf(PlatformText::NotAPlugIn), "%s はこのプログラムのプラグインではありません"},
    {idOf(PlatformText::BuiltForOther),
     "%s はプラットフォームの版 %d 用に作られています。このプラットフォームの版は %d です"},
    {idOf(PlatformText::DoesNotExport), "%s は %s をエクスポートしていません"},
    {idOf(PlatformText::OneNotPasted), "1 個の値を貼り付けられませんでした:"},
    {idOf(PlatformText::NotPasted), "%zu 個の値を貼り付けられませんでした:"},
    {idOf(PlatformText::RefusedValue), "行 %u、列 %u: \"%s\" - %s"},
    {idOf(PlatformText::MoreRefused), "ほか %zu 個"},
    {idOf(PlatformText::CellIsReadOnly), "このセルは変更できません"},
    {idOf(PlatformText::ZeroOrOne), "0 または 1 を入力してください"},
    {idOf(PlatformText::NotAChoice), "選択肢にありません"},
    {idOf(PlatformText::NoSuchColumn), "その列はありません"},
    {idOf(PlatformText::NoSuchLine), "その行はありません"},
    {idOf(PlatformText::SyntaxError), "%s が必要ですが、%s があります"},
    {idOf(PlatformText::EndOfFile), "ファイルの終わり"},
    {idOf(PlatformText::EndOfLine), "行の終わり"},
    {idOf(PlatformText::CommaOrEndOfLine), "',' または行の終わり"},
    {idOf(PlatformText::ClosingQuote), "文字列を閉じる '\"'"},
    {idOf(PlatformText::KnownEscape), "\\\" \\\\ \\n \\r \\t、または \\x と 2 桁の 16 進数"},
    {idOf(PlatformText::Value), "値 (数値、true、false、nan、inf、-inf、または二重引用符で囲んだ文字列)"},
    {idOf(PlatformText::ExponentDigits), "指数の 'e' に続く数字"},
    {idOf(PlatformText::WholeNumber), "-2147483648 から 2147483647 までの整数、または小数点のある数値"},
    {idOf(PlatformText::NumberInRange), "倍精度で表せる範囲の数値、または inf"},
    {idOf(PlatformText::TargetName), "target の名前"},
    {idOf(PlatformText::SectionName), "section の名前"},
    {idOf(PlatformText::SectionOrEnd), "'section' または '}'"},
    {idOf(PlatformText::SectionKeywordOrEnd), "'section'、キーワード名、または '}'"},
    {idOf(PlatformText::MostBraces), "%d 重までの波括弧"},
};

} // namespace

// What the language library shows of itself; see kota::resourcesOf.
extern "C" KOTA_EXPORT const kota::Resources* KotaResources() {
    static const kota::Resources texts{.strings = japanese};
    return &texts;
}
