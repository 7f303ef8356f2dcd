#include "tests/random/player.h"

#include "exchange/packages/packages.h"
#include "platform/framework/input.h"
#include "platform/framework/property_sheet.h"
#include "platform/framework/turn.h"
#include "tests/random/invariants.h"
#include "tests/random/plays.h"

#include <algorithm>
#include <array>

namespace kota::random_user {

namespace {

// The messages at which the shell may do something, by their names in a script.
std::string momentOf(const headless::Received& message) {
    if (message.message == showToolbarMessage())
        return "show";
    if (message.message == hideToolbarMessage())
        return "hide";
    return std::to_string(message.code);
}

// Before anything can be done there is a document.
bool needsDocument(Verb verb) {
    constexpr std::array settings = {Verb::Project, Verb::Rivers,    Verb::Units, Verb::Answer, Verb::New,
                                     Verb::Open,    Verb::Clipboard, Verb::Offer, Verb::When};
    return std::ranges::find(settings, verb) == settings.end();
}

// How many lines the page in front shows, and how many records its document has.
std::pair<std::size_t, std::size_t> lineCount(Stage& stage) {
    std::size_t lines = 0;
    std::size_t records = 0;
    if (const CPropertyPage* const page = stage.page())
        for (const CGXGridCore* const grid : Stage::gridsOf(*page))
            lines += grid->GetRowCount();
    if (const CKota0_adDoc* const document = stage.document())
        for (const CObList* const list : listsOf(*document))
            records += static_cast<std::size_t>(list->GetCount());
    return {lines, records};
}

// Leaves what the user types, and looks at what the page stores.
bool settle(Stage& stage, const Surroundings& surroundings) {
    gridPlayOf(Verb::Leave)(stage, {});
    return checkStored(stage, surroundings);
}

// Takes the last gesture back and does it again.
bool undoAndRedo(Stage& stage, const Surroundings& surroundings) {
    if (!settle(stage, surroundings))
        return false;
    CGXGridCore* const grid = stage.grid();
    if (!grid || !input::focus(*grid) || !grid->CanUndo())
        return false;
    const std::string texts = textsOf(*grid);
    const std::string content = contentOf(stage, *stage.document());
    const int callBacks = stage.callBacks;
    const bool isDone = playCommand(stage, "undo") && pressKey("Ctrl+Y");
    if (stage.callBacks != callBacks) // the shell did something besides
        return true;
    if (!isDone)
        throw Broken("what can be undone can be redone: it cannot");
    if (stage.grid() != grid || textsOf(*grid) != texts)
        throw Broken("an undo and a redo change nothing: the grid held\n" + texts + "and holds\n" +
                     textsOf(*grid));
    if (!settle(stage, surroundings) || contentOf(stage, *stage.document()) != content)
        throw Broken("an undo and a redo change nothing: the document is another");
    return true;
}

} // namespace

Player::Player(Stage& stage, const Surroundings& surroundings) : stage_(stage), surroundings_(surroundings) {
    stage_.session().mainWindow().onMessage = [this](const headless::Received& message) {
        callBack(momentOf(message));
    };
    stage_.screen().onBox = [this] { callBack("box"); };
}

Player::~Player() {
    stage_.session().mainWindow().onMessage = nullptr;
    stage_.screen().onBox = nullptr;
}

void Player::callBack(const std::string& moment) {
    const auto found = std::ranges::find(stage_.armed, moment, &Armed::moment);
    if (found == stage_.armed.end() || stage_.isInside)
        return;
    const Action action = found->action;
    stage_.armed.erase(found);
    stage_.isInside = true;
    ++stage_.callBacks;
    play(action);
    stage_.isInside = false;
}

bool Player::play(const Action& action) {
    for (const auto playsOf : {gridPlayOf, windowPlayOf, shellPlayOf})
        if (const Play plays = playsOf(action.verb))
            return plays(stage_, action);
    switch (action.verb) {
    case Verb::When:
        stage_.armed.push_back({action.texts[0], action.inner.front()});
        return true;
    case Verb::Settle:
        return !stage_.isInside && settle(stage_, surroundings_);
    case Verb::UndoRedo:
        return !stage_.isInside && undoAndRedo(stage_, surroundings_);
    default:
        return false;
    }
}

bool Player::step(const Action& action) {
    if (needsDocument(action.verb) && !stage_.front())
        stage_.session().create();
    const auto lines = lineCount(stage_);
    const int callBacks = stage_.callBacks;
    const bool taken = play(action);
    if (lineCount(stage_) != lines)
        stage_.linesChanged = true;
    {
        const Turn turn; // a screen makes one for what happened outside of any
    }
    checkBoxes(stage_);
    checkWindows(stage_);
    checkGrids(stage_);
    if (taken && (action.verb == Verb::Save || action.verb == Verb::SaveAs) &&
        stage_.callBacks == callBacks && stage_.document() && !stage_.document()->IsModified())
        checkSaved(stage_, *stage_.document(), surroundings_);
    return taken;
}

void Player::finish() {
    stage_.armed.clear();
    settle(stage_, surroundings_);
    checkShownTwice(stage_);
    checkBoxes(stage_);
    stage_.session().closeMainWindow();
    if (!stage_.documents().empty())
        throw Broken("no document is left when all is closed: " + std::to_string(stage_.documents().size()));
}

std::optional<std::string> playScript(const Script& script, const Surroundings& surroundings, Counts& taken) {
    std::string now;
    try {
        Stage stage;
        Player player(stage, surroundings);
        for (std::size_t i = 0; i < script.size(); ++i) {
            now = "action " + std::to_string(i + 1) + ", " + print(script[i]);
            if (player.step(script[i]))
                ++taken[static_cast<std::size_t>(script[i].verb)];
        }
        now = "the end";
        player.finish();
        return std::nullopt;
    } catch (const std::exception& broken) {
        return std::string(broken.what()) + "\nat " + now;
    }
}

} // namespace kota::random_user
