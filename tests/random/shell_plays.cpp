// What is done with documents and windows, by the user, the shell and sibling editors.
#include "editing/base/unit_items.h"
#include "exchange/packages/packages.h"
#include "platform/foundation/units.h"
#include "platform/framework/frame.h"
#include "platform/framework/input.h"
#include "platform/framework/messages.h"
#include "platform/framework/turn.h"
#include "tests/random/plays.h"

#include <sstream>

namespace kota::random_user {

namespace {

// More open documents and windows than this show nothing that fewer do not.
constexpr std::size_t mostDocuments = 3;
constexpr std::size_t mostWindows = 5;

constexpr std::intptr_t projectHandle = 4711;

// Whether another document may come: as long as there are few, and none whose text is refused is left for it.
bool mayOpen(Stage& stage) {
    return stage.documents().size() < mostDocuments && stage.frames().size() < mostWindows &&
           stage.session().mainWindow().GetSafeHwnd() && stage.session().mainWindow().TakePendingInput();
}

bool playProject(Stage& stage, const Action& action) {
    stage.session().mainWindow().openProject(action.texts[0] == "open" ? projectHandle : 0);
    return true;
}

bool playRivers(Stage& stage, const Action& action) {
    std::vector<std::string>& rivers = stage.session().mainWindow().project().rivers;
    rivers.clear();
    std::istringstream names(action.texts[0]);
    for (std::string name; std::getline(names, name);)
        rivers.push_back(name);
    return true;
}

// Units are chosen at the start of the program.
bool playUnits(Stage& stage, const Action& action) {
    return stage.documents().empty() &&
           setDisplayUnit(::UnitItem::Chainage, wrapped(action.numbers[0], 2) - 1) &&
           setDisplayUnit(::UnitItem::FirstOrderRate, wrapped(action.numbers[1], 2) - 1);
}

bool playAnswer(Stage& stage, const Action& action) {
    const std::string& word = action.texts[0];
    stage.screen().answer = word == "yes" ? Answer::Yes : word == "no" ? Answer::No : Answer::Cancel;
    return true;
}

bool playNew(Stage& stage, const Action& /*action*/) {
    return mayOpen(stage) && stage.session().create();
}

bool playOpen(Stage& stage, const Action& action) {
    return mayOpen(stage) && stage.session().open(stage.file(action.numbers[0]));
}

bool playNewWindow(Stage& stage, const Action& /*action*/) {
    return stage.frames().size() < mostWindows && input::command(ID_WINDOW_NEW);
}

bool playClose(Stage& stage, const Action& /*action*/) {
    return stage.front() && input::close(*stage.front());
}

bool playFront(Stage& stage, const Action& action) {
    const std::vector<CMDIChildWnd*> frames = stage.frames();
    return !frames.empty() &&
           input::activate(*frames[static_cast<std::size_t>(wrapped(action.numbers[0], frames.size()) - 1)]);
}

bool playClipboard(Stage& stage, const Action& action) {
    stage.screen().setClipboardText(action.texts[0].c_str());
    return true;
}

bool playOffer(Stage& stage, const Action& action) {
    const auto chainage = static_cast<double>(action.numbers[0]);
    stage.session().mainWindow().project().offers.push_back(
        {action.texts[0], chainage, chainage / 2, action.numbers[1]});
    return true;
}

bool playSave(Stage& stage, const Action& /*action*/) {
    CKota0_adDoc* const document = stage.document();
    return document && stage.session().save(*document);
}

bool playSaveAs(Stage& stage, const Action& action) {
    CKota0_adDoc* const document = stage.document();
    return document && !action.texts[0].empty() &&
           stage.session().saveAs(*document, stage.folder().file(action.texts[0]));
}

bool playSibling(Stage& stage, const Action& action) {
    CKota0_adView* const view = stage.view();
    if (!view)
        return false;
    CK31_CBE_ModelDataItem item;
    item.riverName = action.texts[0].c_str();
    item.chainage = action.numbers[1];
    item.dataType = action.numbers[2];
    CObList items;
    items.AddTail(&item);
    CKHComm_Package package;
    package.items = &items;
    const Turn turn;
    view->SendMessage(communicationMessage(), static_cast<WPARAM>(action.numbers[0]),
                      reinterpret_cast<LPARAM>(&package));
    return true;
}

} // namespace

Play shellPlayOf(Verb verb) {
    switch (verb) {
    case Verb::Project:
        return playProject;
    case Verb::Rivers:
        return playRivers;
    case Verb::Units:
        return playUnits;
    case Verb::Answer:
        return playAnswer;
    case Verb::New:
        return playNew;
    case Verb::Open:
        return playOpen;
    case Verb::NewWindow:
        return playNewWindow;
    case Verb::Close:
        return playClose;
    case Verb::Front:
        return playFront;
    case Verb::Clipboard:
        return playClipboard;
    case Verb::Offer:
        return playOffer;
    case Verb::Save:
        return playSave;
    case Verb::SaveAs:
        return playSaveAs;
    case Verb::Sibling:
        return playSibling;
    default:
        return nullptr;
    }
}

} // namespace kota::random_user
