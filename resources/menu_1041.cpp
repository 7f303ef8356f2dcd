#include "resources/menu_tree.h"
#include "resources/texts.h"

namespace {

constexpr MenuTexts japanese{
    .file = "ファイル(&F)",
    .fileNew = "新規作成(&N)\tCtrl+N",
    .fileOpen = "開く(&O)...\tCtrl+O",
    .fileClose = "閉じる(&C)",
    .fileSave = "上書き保存(&S)\tCtrl+S",
    .fileSaveAs = "名前を付けて保存(&A)...",
    .filePrint = "印刷(&P)...\tCtrl+P",
    .filePrintPreview = "印刷プレビュー(&V)",
    .filePrintSetup = "プリンターの設定(&R)...",
    .recentFile = "最近使ったファイル",
    .dataUtility = "データ ユーティリティ...",
    .exit = "終了(&X)",
    .edit = "編集(&E)",
    .undo = "元に戻す(&U)\tCtrl+Z",
    .cut = "切り取り(&T)\tCtrl+X",
    .copy = "コピー(&C)\tCtrl+C",
    .paste = "貼り付け(&P)\tCtrl+V",
    .view = "表示(&V)",
    .toolbar = "ツール バー(&T)...",
    .statusBar = "ステータス バー(&S)",
    .grid = "グリッド(&G)",
    .insertLine = "行の挿入(&I)\tIns",
    .deleteLine = "行の削除(&D)\tDel",
    .search = "検索(&S)\tF7",
    .findNext = "次を検索(&N)\tF3",
    .gotoLine = "行へ移動(&T)...",
    .window = "ウィンドウ(&W)",
    .newWindow = "新しいウィンドウ(&N)",
    .cascade = "重ねて表示(&C)",
    .tile = "並べて表示(&T)",
    .arrangeIcons = "アイコンの整列(&A)",
    .help = "ヘルプ(&H)",
    .helpTopics = "トピックの検索(&H)...",
    .about = "KOTAHub について(&A)...",
};

} // namespace

std::span<const kota::MenuTemplate> japaneseMenus() {
    return MenuTree<japanese>::all;
}
