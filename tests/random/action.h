#pragma once

#include <string>
#include <string_view>
#include <vector>

namespace kota::random_user {

// What the user, the shell or a sibling editor may do. Places are relative: line 7 of a grid with five lines
// is its second, so that an action means something wherever it stands, and a script from which actions were
// dropped is still a script.
enum class Verb {
    Project,   // a project is open or not, for the documents to come
    Rivers,    // those of the project, one a line
    Units,     // the display units of chainage and rate, before the first document
    Answer,    // what the user says to questions from now on
    New,       // a new document
    Open,      // the n-th of the files that are there
    NewWindow, // of the document in front
    Close,     // the window in front, by its button
    Front,     // the n-th window comes to the front
    Tab,       // by its caption
    Go,        // to the n-th control of the page
    Field,     // types into the n-th edit of the page
    Press,     // the n-th button or box of the page
    Pick,      // an entry of the n-th combo box of the page
    Cell,      // a click
    Type,      // into the current cell or the edit with the focus
    Edit,      // a click on a cell and a text for it
    Entry,     // a click on a cell and an entry of its list
    List,      // of the current cell's entries: opened or closed
    Line,      // selected by its header
    Lines,     // the same from one to another
    AlsoLine,  // selected besides what is
    Block,     // selected by dragging
    Leave,     // the focus goes to the tabs
    Key,       // as "Shift+Tab"
    Command,   // of the menu
    Clipboard, // somebody else put this on it
    Offer,     // the shell's answer to a request for a location: river, chainage, kind of data
    Search,    // river, chainage, test of chainage, test of text, and how the dialog is left
    Goto,      // a line's number, and how the dialog is left
    Save,      // under its name, or one that is asked for
    SaveAs,    // under a name in the folder of the script
    Sibling,   // code, river, chainage, kind of data: a sibling's package for the window in front
    When,      // the shell does this when the editor sends that message next, or a box stands open
    Settle,    // leaves the cell and stores: what is shown is what is held
    UndoRedo,  // changes nothing
};

struct Action {
    Verb verb = Verb::New;
    std::vector<int> numbers = {};
    std::vector<std::string> texts = {}; // words and texts, in their order
    std::vector<Action> inner = {};      // of When: the one

    friend bool operator==(const Action&, const Action&) = default;
};

using Script = std::vector<Action>;

// How an action of a verb is written: its name and its arguments, a letter each.
struct Form {
    Verb verb;
    std::string_view name;
    std::string_view arguments; // n number, w word, t text in quotes, a action
};

inline constexpr std::size_t verbCount = static_cast<std::size_t>(Verb::UndoRedo) + 1;
const Form& formOf(Verb verb);

// One line each, without its end.
std::string print(const Action& action);
// A line for each action.
std::string print(const Script& script);

// Both throw std::invalid_argument, which tells what is wrong. An action may have blanks around it.
Action parseAction(std::string_view line);
// Empty lines and lines that begin with "#" count for nothing.
Script parseScript(std::string_view text);

} // namespace kota::random_user
