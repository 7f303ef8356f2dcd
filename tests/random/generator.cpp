#include "tests/random/generator.h"

#include "tests/random/dice.h"
#include "tests/random/plays.h"

#include <array>

namespace kota::random_user {

namespace {

// Draws the actions of a script.
class Author {
public:
    Author(std::uint64_t seed, const Surroundings& surroundings) : dice_(seed), surroundings_(surroundings) {}

    Script write(int steps) {
        begin();
        while (script_.size() < static_cast<std::size_t>(steps))
            addPhrase();
        return std::move(script_);
    }

private:
    struct Phrase {
        int weight;
        void (Author::*add)();
    };
    static const std::array<Phrase, 23> phrases;

    void add(Verb verb, std::vector<int> numbers = {}, std::vector<std::string> texts = {}) {
        script_.push_back({.verb = verb, .numbers = std::move(numbers), .texts = std::move(texts)});
    }
    void press(const std::string& key) { add(Verb::Key, {}, {key}); }
    void run(const std::string& command) { add(Verb::Command, {}, {command}); }
    int place() { return dice_.between(1, 6); }

    void begin() {
        if (dice_.onceIn(4))
            add(Verb::Units, {dice_.between(1, 2), dice_.between(1, 2)});
        if (!dice_.onceIn(4)) {
            add(Verb::Project, {}, {"open"});
            add(Verb::Rivers, {}, {dice_.onceIn(5) ? "" : "MISSOURI\nPLATTE\nJames"});
        }
        if (dice_.onceIn(2))
            add(Verb::Open, {dice_.between(1, 40)});
        changeTab();
    }

    void addPhrase() {
        int total = 0;
        for (const Phrase& phrase : phrases)
            total += phrase.weight;
        int drawn = static_cast<int>(dice_.below(static_cast<std::size_t>(total)));
        const auto* phrase = phrases.data();
        while (drawn >= phrase->weight)
            drawn -= (phrase++)->weight;
        (this->*phrase->add)();
    }

    void changeTab() {
        const bool isEmpty = surroundings_.tabs.empty() || dice_.onceIn(8);
        const std::vector<std::string>& tabs = isEmpty ? surroundings_.emptyTabs : surroundings_.tabs;
        if (!tabs.empty())
            add(Verb::Tab, {}, {dice_.one(tabs)});
    }
    void edit() {
        add(Verb::Edit, {place(), place()}, {anyText(dice_)});
        if (!dice_.onceIn(5))
            endEdit();
    }
    void endEdit() {
        constexpr std::array keys = {"Tab", "Tab",  "Enter",  "Enter", "Shift+Tab",
                                     "Up",  "Down", "Escape", "F2"};
        if (dice_.onceIn(3))
            add(Verb::Cell, {place(), place()});
        else if (dice_.onceIn(8))
            add(Verb::Leave);
        else
            press(dice_.one(keys));
    }
    void retype() {
        add(Verb::Type, {}, {anyText(dice_)});
        if (dice_.onceIn(2))
            endEdit();
    }
    void click() { add(Verb::Cell, {place(), place()}); }
    void choose() {
        add(Verb::Entry, {place(), dice_.between(1, 3), dice_.between(1, 12)});
        if (dice_.onceIn(2))
            endEdit();
    }
    void openList() {
        add(Verb::List, {}, {"open"});
        if (dice_.onceIn(2))
            add(Verb::Type, {}, {anyText(dice_)});
        add(Verb::List, {}, {"close"});
    }
    void selectLines() {
        if (dice_.onceIn(2))
            add(Verb::Line, {place()});
        else
            add(Verb::Lines, {place(), place()});
        if (dice_.onceIn(4))
            add(Verb::AlsoLine, {place()});
        constexpr std::array commands = {"delete-line", "cut", "copy", "insert-line"};
        if (dice_.onceIn(2))
            press("Delete");
        else if (dice_.onceIn(2))
            run(dice_.one(commands));
    }
    void selectBlock() {
        add(Verb::Block, {place(), place(), place(), place()});
        constexpr std::array commands = {"cut", "copy", "paste"};
        run(dice_.one(commands));
    }
    void insertLine() {
        if (dice_.onceIn(2))
            add(Verb::Offer, {dice_.between(0, 5000), dice_.between(0, 7)}, {anyRiver(dice_)});
        dice_.onceIn(2) ? press("Insert") : run("insert-line");
    }
    void appendByKey() {
        add(Verb::Cell, {0, 0}); // the last cell of the last line
        if (dice_.onceIn(2))
            add(Verb::Type, {}, {anyText(dice_)});
        press(dice_.onceIn(2) ? "Tab" : "Enter");
    }
    void pressKey() {
        std::string key = dice_.one(keyNames());
        for (const char* const held : {"Shift+", "Alt+", "Ctrl+"})
            if (dice_.onceIn(5))
                key = held + key;
        press(key);
    }
    void undo() {
        for (int times = dice_.between(1, 3); times > 0; --times)
            dice_.onceIn(3) ? press("Ctrl+Y") : run("undo");
    }
    void undoRedo() { add(Verb::UndoRedo); }
    void settle() { add(Verb::Settle); }
    void paste() {
        add(Verb::Clipboard, {}, {anyTable(dice_)});
        if (dice_.onceIn(2))
            click();
        run("paste");
    }
    void runCommand() { run(dice_.one(commandNames())); }
    void useControls() {
        switch (dice_.below(6)) {
        case 0:
            return add(Verb::Press, {place()});
        case 1:
            return add(Verb::Pick, {place(), place()});
        case 2:
            return add(Verb::Go, {place()});
        default:
            add(Verb::Field, {place()}, {anyText(dice_)});
            if (!dice_.onceIn(3))
                dice_.onceIn(2) ? add(Verb::Leave) : add(Verb::Go, {place()});
        }
    }
    void search() {
        constexpr std::array ends = {"ok", "ok", "ok", "cancel"};
        if (dice_.onceIn(3))
            return add(Verb::Goto, {}, {anyText(dice_), dice_.one(ends)});
        add(Verb::Search, {place(), place()}, {anyRiver(dice_), anyText(dice_), dice_.one(ends)});
        for (int times = dice_.between(0, 2); times > 0; --times)
            press("F3");
    }
    void save() {
        constexpr std::array names = {"a", "b.ad31", "c.AD31", "ö d.ad31", "missing/e.ad31", "a.b"};
        if (dice_.onceIn(2))
            add(Verb::SaveAs, {}, {dice_.one(names)});
        else
            add(Verb::Save);
    }
    void useWindows() {
        constexpr std::array verbs = {Verb::New, Verb::NewWindow, Verb::NewWindow, Verb::Close};
        if (dice_.onceIn(4))
            add(Verb::Open, {dice_.between(1, 40)});
        else if (dice_.onceIn(2))
            add(Verb::Front, {place()});
        else
            add(dice_.one(verbs));
    }
    void changeAnswer() {
        constexpr std::array answers = {"yes", "no", "cancel"};
        add(Verb::Answer, {}, {dice_.one(answers)});
    }
    void hearSibling() {
        constexpr std::array codes = {42, 62, 62, 82, 7};
        add(Verb::Sibling, {dice_.one(codes), dice_.between(0, 5000), dice_.between(-1, 8)},
            {anyRiver(dice_)});
    }
    // What a shell does sooner than a user.
    void disturb() {
        switch (dice_.below(6)) {
        case 0:
            return add(Verb::Close);
        case 1:
            return changeTab();
        case 2:
            return run(dice_.onceIn(2) ? "undo" : "delete-line");
        case 3:
            return add(Verb::Save);
        default:
            return useWindows();
        }
    }
    // The shell does something in the middle of what comes next.
    void armShell() {
        constexpr std::array moments = {"24", "25", "52", "200", "503", "523", "show", "hide", "box"};
        const std::size_t before = script_.size();
        while (script_.size() == before)
            dice_.onceIn(2) ? disturb() : addPhrase();
        const Action first = script_[before];
        if (first.verb == Verb::When)
            return;
        script_[before] = {.verb = Verb::When, .texts = {dice_.one(moments)}, .inner = {first}};
    }

    Dice dice_;
    const Surroundings& surroundings_;
    Script script_;
};

constexpr std::array<Author::Phrase, 23> Author::phrases = {{
    {12, &Author::changeTab},  {30, &Author::edit},       {6, &Author::retype},
    {10, &Author::click},      {7, &Author::choose},      {3, &Author::openList},
    {9, &Author::selectLines}, {5, &Author::selectBlock}, {7, &Author::insertLine},
    {5, &Author::appendByKey}, {9, &Author::pressKey},    {8, &Author::undo},
    {4, &Author::undoRedo},    {8, &Author::settle},      {7, &Author::paste},
    {6, &Author::runCommand},  {8, &Author::useControls}, {6, &Author::search},
    {6, &Author::save},        {6, &Author::useWindows},  {3, &Author::changeAnswer},
    {3, &Author::hearSibling}, {5, &Author::armShell},
}};

} // namespace

Script makeScript(std::uint64_t seed, int steps, const Surroundings& surroundings) {
    return Author(seed, surroundings).write(steps);
}

std::uint64_t seedOf(std::uint64_t seed, std::uint64_t n) {
    return Dice(seed ^ Dice(n).next()).next();
}

} // namespace kota::random_user
