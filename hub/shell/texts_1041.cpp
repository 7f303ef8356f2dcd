#include "hub/shell/commands.h"
#include "hub/shell/menu_tree.h"
#include "hub/shell/texts.h"

namespace kota::hub {

namespace {

constexpr MenuTexts menu{
    .file = "ファイル(&F)",
    .fileNew = "新規作成(&N)\tCtrl+N",
    .fileOpen = "開く(&O)...\tCtrl+O",
    .fileClose = "閉じる(&C)",
    .fileSave = "上書き保存(&S)\tCtrl+S",
    .fileSaveAs = "名前を付けて保存(&A)...",
    .recentFile = "最近使ったファイル",
    .openProject = "プロジェクトを開く(&P)...",
    .closeProject = "プロジェクトを閉じる(&J)",
    .dataUtility = "データ ユーティリティ...",
    .settings = "設定(&T)...",
    .exit = "終了(&X)\tCtrl+Q",
    .edit = "編集(&E)",
    .undo = "元に戻す(&U)\tCtrl+Z",
    .cut = "切り取り(&T)\tCtrl+X",
    .copy = "コピー(&C)\tCtrl+C",
    .paste = "貼り付け(&P)\tCtrl+V",
    .view = "表示(&V)",
    .toolbar = "ツール バー(&T)",
    .statusBar = "ステータス バー(&S)",
    .riverMap = "河川図(&M)",
    .exchange = "データ交換(&E)",
    .window = "ウィンドウ(&W)",
    .newWindow = "新しいウィンドウ(&N)",
    .cascade = "重ねて表示(&C)",
    .tile = "並べて表示(&T)",
    .arrangeIcons = "アイコンの整列(&A)",
    .help = "ヘルプ(&H)",
    .about = "KOTAHub について(&A)...",
};

constexpr StringResource strings[] = {
    {idOf(HubText::NoEditorFor), "%1 を開けません。この種類のファイルに対応するエディターがありません。"},
    {idOf(HubText::New), "新規作成"},
    {idOf(HubText::WhatKind), "文書の種類を選んでください。"},
    {idOf(HubText::About), "KOTAHub について"},
    {idOf(HubText::VersionAndEditors), "KOTAHub %1\n\nエディター: %2"},
    {idOf(HubText::NoEditors), "なし"},
    {idOf(HubText::NotLoaded), "%1 を読み込めませんでした: %2"},
    {idOf(HubText::NoEditorIn), "%1 にエディターがありません。"},
    {idOf(HubText::RecentFile), "最近使ったファイル"},
    {idOf(HubText::RiverMap), "河川図"},
    {idOf(HubText::Exchange), "データ交換"},
    {idOf(HubText::RiverNetworks), "河川網"},
    {idOf(HubText::Filter), "次を含むものを表示..."},
    {idOf(HubText::CopyMessages), "コピー"},
    {idOf(HubText::ClearMessages), "消去"},
    {idOf(HubText::ColumnTime), "時刻"},
    {idOf(HubText::ColumnCode), "コード"},
    {idOf(HubText::ColumnMeaning), "意味"},
    {idOf(HubText::ColumnSender), "送信元"},
    {idOf(HubText::ColumnRiver), "河川"},
    {idOf(HubText::ColumnChainage), "追加距離 (m)"},
    {idOf(HubText::ColumnData), "データ"},
    {idOf(HubText::LeavesProject), "プロジェクトから離れる"},
    {idOf(HubText::JoinsProject), "プロジェクトを問い合わせる"},
    {idOf(HubText::AsksForRivers), "河川を問い合わせる"},
    {idOf(HubText::AsksForLocation), "位置を問い合わせる"},
    {idOf(HubText::LocationChanged), "位置が変わった"},
    {idOf(HubText::DataChanged), "データが変わった"},
    {idOf(HubText::ShowsToolBar), "ツール バーを表示する"},
    {idOf(HubText::HidesToolBar), "ツール バーを隠す"},
    {idOf(HubText::UnknownCode), "不明"},
    {idOf(HubText::DataInit), "初期条件"},
    {idOf(HubText::DataSediment), "土砂"},
    {idOf(HubText::DataNonCohesive), "非粘着性"},
    {idOf(HubText::DataLayer), "底質層"},
    {idOf(HubText::DataDecay), "減衰"},
    {idOf(HubText::DataDispersion), "分散"},
    {idOf(HubText::DataIce), "結氷データ"},
    {idOf(HubText::DataBoundary), "境界"},
    {idOf(HubText::Settings), "設定"},
    {idOf(HubText::Language), "言語"},
    {idOf(HubText::LanguageOfEnvironment), "システムに合わせる"},
    {idOf(HubText::DisplayUnits), "表示単位"},
    {idOf(HubText::UnitChainage), "追加距離"},
    {idOf(HubText::UnitWidth), "幅"},
    {idOf(HubText::UnitLayerHeight), "層厚"},
    {idOf(HubText::UnitRate), "一次反応速度定数"},
    {idOf(HubText::AtNextStart), "変更は次回の起動時に有効になります。"},
    {ID_FILE_NEW, "新しい文書を作成します。"},
    {ID_FILE_OPEN, "既存の文書を開きます。"},
    {ID_FILE_CLOSE, "文書とそのすべてのウィンドウを閉じます。"},
    {ID_FILE_SAVE, "文書を保存します。"},
    {ID_FILE_SAVE_AS, "文書を別の名前で保存します。"},
    {ID_FILE_MRU_FILE1, "この文書を開きます。"},
    {ID_APP_EXIT, "すべての文書を閉じてプログラムを終了します。"},
    {ID_EDIT_UNDO, "直前の操作を元に戻します。"},
    {ID_EDIT_CUT, "選択範囲を切り取ってクリップボードに移します。"},
    {ID_EDIT_COPY, "選択範囲をクリップボードにコピーします。"},
    {ID_EDIT_PASTE, "クリップボードの内容を貼り付けます。"},
    {ID_VIEW_TOOLBAR, "ツール バーの表示と非表示を切り替えます。"},
    {ID_VIEW_STATUS_BAR, "ステータス バーの表示と非表示を切り替えます。"},
    {ID_WINDOW_NEW, "文書の別のウィンドウを開きます。"},
    {ID_WINDOW_CASCADE, "ウィンドウを重ねて並べます。"},
    {ID_WINDOW_TILE_HORZ, "ウィンドウを並べて表示します。"},
    {ID_WINDOW_ARRANGE, "アイコン化されたウィンドウを整列して表示します。"},
    {ID_APP_ABOUT, "プログラムのバージョンとエディターを表示します。"},
    {HubCommand::OpenProject, "河川網をプロジェクトとして開きます。"},
    {HubCommand::CloseProject, "プロジェクトを閉じます。文書は開いたままです。"},
    {HubCommand::Settings, "言語と表示単位を選びます。"},
    {HubCommand::ShowMap, "河川図の表示と非表示を切り替えます。"},
    {HubCommand::ShowExchange, "エディターのメッセージの表示と非表示を切り替えます。"},
};

} // namespace

const Resources& japaneseTexts() {
    static const Resources texts{.strings = strings, .menus = MenuTree<menu>::all};
    return texts;
}

} // namespace kota::hub

// What the language library shows of itself; see kota::resourcesOf.
extern "C" KOTA_EXPORT const kota::Resources* KotaResources() {
    return &kota::hub::japaneseTexts();
}
