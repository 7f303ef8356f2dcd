#include "tests/random/action.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <stdexcept>

namespace kota::random_user {

namespace {

constexpr std::array<Form, verbCount> forms = {{
    {Verb::Project, "project", "w"},
    {Verb::Rivers, "rivers", "t"},
    {Verb::Units, "units", "nn"},
    {Verb::Answer, "answer", "w"},
    {Verb::New, "new", ""},
    {Verb::Open, "open", "n"},
    {Verb::NewWindow, "new-window", ""},
    {Verb::Close, "close", ""},
    {Verb::Front, "front", "n"},
    {Verb::Tab, "tab", "t"},
    {Verb::Go, "go", "n"},
    {Verb::Field, "field", "nt"},
    {Verb::Press, "press", "n"},
    {Verb::Pick, "pick", "nn"},
    {Verb::Cell, "cell", "nn"},
    {Verb::Type, "type", "t"},
    {Verb::Edit, "edit", "nnt"},
    {Verb::Entry, "entry", "nnn"},
    {Verb::List, "list", "w"},
    {Verb::Line, "line", "n"},
    {Verb::Lines, "lines", "nn"},
    {Verb::AlsoLine, "also-line", "n"},
    {Verb::Block, "block", "nnnn"},
    {Verb::Leave, "leave", ""},
    {Verb::Key, "key", "w"},
    {Verb::Command, "command", "w"},
    {Verb::Clipboard, "clipboard", "t"},
    {Verb::Offer, "offer", "tnn"},
    {Verb::Search, "search", "ttnnw"},
    {Verb::Goto, "goto", "tw"},
    {Verb::Save, "save", ""},
    {Verb::SaveAs, "save-as", "t"},
    {Verb::Sibling, "sibling", "ntnn"},
    {Verb::When, "when", "wa"},
    {Verb::Settle, "settle", ""},
    {Verb::UndoRedo, "undo-redo", ""},
}};

constexpr bool areInOrder() {
    for (std::size_t i = 0; i < forms.size(); ++i)
        if (static_cast<std::size_t>(forms[i].verb) != i)
            return false;
    return true;
}
static_assert(areInOrder());

constexpr std::string_view blanks = " \t\r";
constexpr std::string_view hexDigits = "0123456789ABCDEF";

std::string quoted(std::string_view text) {
    std::string result = "\"";
    for (const char character : text) {
        const auto byte = static_cast<unsigned char>(character);
        if (character == '"' || character == '\\')
            result += {'\\', character};
        else if (character == '\n' || character == '\t' || character == '\r')
            result += {'\\', character == '\n' ? 'n' : character == '\t' ? 't' : 'r'};
        else if (byte < 0x20 || byte == 0x7F)
            result += {'\\', 'x', hexDigits[byte >> 4U], hexDigits[byte & 0xFU]};
        else
            result += character;
    }
    return result + '"';
}

[[noreturn]] void fail(const std::string& what, std::string_view at) {
    throw std::invalid_argument(what + " at: " + std::string(at));
}

// Reads a line from its front.
class Reader {
public:
    explicit Reader(std::string_view line) : rest_(line) {}

    std::string word() {
        skipBlanks();
        const std::size_t length = std::min(rest_.find_first_of(blanks), rest_.size());
        if (length == 0)
            fail("a word is missing", rest_);
        return taken(length);
    }

    int number() {
        const std::string text = word();
        int value = 0;
        const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), value);
        if (error != std::errc() || end != text.data() + text.size())
            fail("no number", text);
        return value;
    }

    std::string text() {
        skipBlanks();
        if (rest_.empty() || rest_.front() != '"')
            fail("a text in quotes is missing", rest_);
        rest_.remove_prefix(1);
        std::string result;
        while (!rest_.empty() && rest_.front() != '"')
            result += character();
        if (rest_.empty())
            fail("a text has no end", result);
        rest_.remove_prefix(1);
        return result;
    }

    std::string_view rest() {
        skipBlanks();
        return rest_;
    }
    void takeRest() { rest_ = {}; }

private:
    void skipBlanks() { rest_.remove_prefix(std::min(rest_.find_first_not_of(blanks), rest_.size())); }

    std::string taken(std::size_t length) {
        const std::string front(rest_.substr(0, length));
        rest_.remove_prefix(length);
        return front;
    }

    char character() {
        const char first = taken(1).front();
        if (first != '\\' || rest_.empty())
            return first;
        const char escape = taken(1).front();
        if (escape != 'x')
            return escape == 'n' ? '\n' : escape == 't' ? '\t' : escape == 'r' ? '\r' : escape;
        const std::size_t high = hexDigits.find(rest_.empty() ? '-' : rest_[0]);
        const std::size_t low = hexDigits.find(rest_.size() < 2 ? '-' : rest_[1]);
        if (high == std::string_view::npos || low == std::string_view::npos)
            fail("two digits are missing", rest_);
        rest_.remove_prefix(2);
        return static_cast<char>(high * 16 + low);
    }

    std::string_view rest_;
};

} // namespace

const Form& formOf(Verb verb) {
    return forms[static_cast<std::size_t>(verb)];
}

std::string print(const Action& action) {
    const Form& form = formOf(action.verb);
    std::string line(form.name);
    auto number = action.numbers.begin();
    auto text = action.texts.begin();
    for (const char argument : form.arguments) {
        line += ' ';
        if (argument == 'n')
            line += std::to_string(*number++);
        else if (argument == 'a')
            line += print(action.inner.front());
        else
            line += argument == 'w' ? *text++ : quoted(*text++);
    }
    return line;
}

std::string print(const Script& script) {
    std::string lines;
    for (const Action& action : script)
        lines += print(action) + '\n';
    return lines;
}

Action parseAction(std::string_view line) {
    Reader reader(line);
    const std::string name = reader.word();
    const auto* const form = std::ranges::find(forms, name, &Form::name);
    if (form == forms.end())
        fail("no such action", name);
    Action action{.verb = form->verb};
    for (const char argument : form->arguments) {
        if (argument == 'n') {
            action.numbers.push_back(reader.number());
        } else if (argument == 'a') {
            action.inner.push_back(parseAction(reader.rest()));
            reader.takeRest();
        } else {
            action.texts.push_back(argument == 'w' ? reader.word() : reader.text());
        }
    }
    if (!reader.rest().empty())
        fail("the action has ended", reader.rest());
    return action;
}

Script parseScript(std::string_view text) {
    Script script;
    while (!text.empty()) {
        const std::size_t length = std::min(text.find('\n'), text.size());
        const std::string_view line = text.substr(0, length);
        text.remove_prefix(std::min(length + 1, text.size()));
        const std::size_t start = line.find_first_not_of(blanks);
        if (start != std::string_view::npos && line[start] != '#')
            script.push_back(parseAction(line));
    }
    return script;
}

} // namespace kota::random_user
