#include "platform/framework/platform_texts.h"

namespace {

using kota::PlatformText;

constexpr UINT id(PlatformText text) {
    return static_cast<UINT>(text);
}

constexpr kota::StringResource japanese[] = {
    {id(PlatformText::InvalidArgument), "操作に無効な引数が渡されました (%s)。"},
    {id(PlatformText::NoHelp), "この項目のヘルプはありません。"},
    {id(PlatformText::NoPrinting), "印刷は利用できません。"},
    {id(PlatformText::IntegerRequired), "整数を入力してください。"},
    {id(PlatformText::SaveChanges), "%s への変更を保存しますか?"},
    {id(PlatformText::TheDocument), "文書"},
    {id(PlatformText::CannotOpen), "%s を開けません: %s。"},
    {id(PlatformText::SaveInterrupted),
     "%s は空です。保存が途中で中断されました。以前の版は %s にあります。"},
    {id(PlatformText::OpenElsewhere), "%s は別のウィンドウで開かれています。先にそちらを閉じてください。"},
    {id(PlatformText::ReplaceFile), "%s はすでに存在します。置き換えますか?"},
    {id(PlatformText::NotKept), "以前の版を残せないため、%s は保存されませんでした: %s。"},
    {id(PlatformText::NotSaved), "文書は保存されませんでした: %s。"},
    {id(PlatformText::NotAFile), "ファイルではありません"},
    {id(PlatformText::SomethingNotFile), "%s はファイルではありません"},
    {id(PlatformText::TooLarge), "4 GiB を超えています"},
    {id(PlatformText::NoMemoryToRead), "%s: 読み込むためのメモリが足りません"},
    {id(PlatformText::UnitOf), "単位: %s"},
    {id(PlatformText::NotAPlugIn), "%s はこのプログラムのプラグインではありません"},
    {id(PlatformText::BuiltForOther),
     "%s はプラットフォームの版 %d 用に作られています。このプラットフォームの版は %d です"},
    {id(PlatformText::DoesNotExport), "%s は %s をエクスポートしていません"},
    {id(PlatformText::OneNotPasted), "1 個の値を貼り付けられませんでした:"},
    {id(PlatformText::NotPasted), "%zu 個の値を貼り付けられませんでした:"},
    {id(PlatformText::RefusedValue), "行 %u、列 %u: \"%s\" - %s"},
    {id(PlatformText::MoreRefused), "ほか %zu 個"},
    {id(PlatformText::CellIsReadOnly), "このセルは変更できません"},
    {id(PlatformText::ZeroOrOne), "0 または 1 を入力してください"},
    {id(PlatformText::NotAChoice), "選択肢にありません"},
    {id(PlatformText::NoSuchColumn), "その列はありません"},
    {id(PlatformText::NoSuchLine), "その行はありません"},
    {id(PlatformText::SyntaxError), "%s が必要ですが、%s があります"},
    {id(PlatformText::EndOfFile), "ファイルの終わり"},
    {id(PlatformText::EndOfLine), "行の終わり"},
    {id(PlatformText::CommaOrEndOfLine), "',' または行の終わり"},
    {id(PlatformText::ClosingQuote), "文字列を閉じる '\"'"},
    {id(PlatformText::KnownEscape), "\\\" \\\\ \\n \\r \\t、または \\x と 2 桁の 16 進数"},
    {id(PlatformText::Value), "値 (数値、true、false、nan、inf、-inf、または二重引用符で囲んだ文字列)"},
    {id(PlatformText::ExponentDigits), "指数の 'e' に続く数字"},
    {id(PlatformText::WholeNumber), "-2147483648 から 2147483647 までの整数、または小数点のある数値"},
    {id(PlatformText::NumberInRange), "倍精度で表せる範囲の数値、または inf"},
    {id(PlatformText::TargetName), "target の名前"},
    {id(PlatformText::SectionName), "section の名前"},
    {id(PlatformText::SectionOrEnd), "'section' または '}'"},
    {id(PlatformText::SectionKeywordOrEnd), "'section'、キーワード名、または '}'"},
    {id(PlatformText::MostBraces), "%d 重までの波括弧"},
};

} // namespace

// What the language library shows of itself; see kota::resourcesOf.
extern "C" KOTA_EXPORT const kota::Resources* KotaResources() {
    static const kota::Resources texts{.strings = japanese};
    return &texts;
}
