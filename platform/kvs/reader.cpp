#include "platform/kvs/reader.h"

#include "platform/kvs/lexicon.h"

#include <array>

namespace kota::kvs {

namespace {

// The grammar of a file, rule by rule.
class Reader {
public:
    Reader(const ByteSource& source, Tree& tree) : tree_(tree), text_(source) {}

    void readFile();

private:
    void readTarget();
    void readMember();
    void open(const std::string& name);
    void readKeyword(std::string_view name);
    void readParameter();
    std::string_view name(PlatformText expected);

    Tree& tree_;
    Scanner text_;
    std::array<Tree::SectionId, deepestNesting + 1> open_{Tree::file}; // from the file inwards
    int depth_ = 0;
};

void Reader::readFile() {
    for (text_.skipSpace(); !text_.atEnd(); text_.skipSpace()) {
        if (text_.peek() == '}' && depth_ > 0) {
            --depth_;
            text_.skip();
        } else if (depth_ == 0) {
            readTarget();
        } else {
            readMember();
        }
    }
    if (depth_ > 0)
        text_.fail("'}'");
}

void Reader::readTarget() {
    const char* start = text_.here();
    if (text_.word() != targetWord)
        text_.fail("'target'", start);
    text_.skipSpace();
    open(std::string(name(PlatformText::TargetName)));
}

// A section or, below a target's own level, a keyword. A word that '=' follows is always a keyword's name.
void Reader::readMember() {
    const char* start = text_.here();
    const bool inTarget = depth_ == 1;
    const bool plain = text_.peek() != '"';
    const std::string_view first =
        name(inTarget ? PlatformText::SectionOrEnd : PlatformText::SectionKeywordOrEnd);
    text_.skipBlanks();
    if (plain && first == sectionWord && text_.peek() != '=') {
        text_.skipSpace();
        open(std::string(name(PlatformText::SectionName)));
    } else if (inTarget) {
        text_.fail(PlatformText::SectionOrEnd, start);
    } else {
        readKeyword(first);
    }
}

// The name is a copy, since the brace may stand on a later line.
void Reader::open(const std::string& name) {
    text_.skipSpace();
    if (text_.peek() != '{')
        text_.fail("'{'");
    if (depth_ == deepestNesting) {
        const CString most = platformText(PlatformText::MostBraces, deepestNesting);
        text_.fail(static_cast<const char*>(most));
    }
    text_.skip();
    open_[depth_ + 1] = tree_.addSection(open_[depth_], name);
    ++depth_;
}

void Reader::readKeyword(std::string_view name) {
    if (text_.peek() != '=')
        text_.fail("'='");
    text_.skip();
    tree_.addKeyword(open_[depth_], name);
    text_.skipBlanks();
    if (text_.atLineEnd() || text_.peek() == '}')
        return;
    for (;;) {
        readParameter();
        text_.skipBlanks();
        if (text_.peek() != ',')
            break;
        text_.skip();
        text_.skipSpace();
    }
    if (!text_.atLineEnd() && text_.peek() != '}')
        text_.fail(PlatformText::CommaOrEndOfLine);
}

void Reader::readParameter() {
    if (text_.peek() == '"')
        tree_.addString(text_.quoted());
    else
        tree_.addParameter(text_.atWord() ? text_.wordValue() : text_.number());
}

std::string_view Reader::name(PlatformText expected) {
    if (text_.peek() == '"')
        return text_.quoted();
    const std::string_view plain = text_.word();
    if (plain.empty())
        text_.fail(expected);
    return plain;
}

} // namespace

void readText(const ByteSource& source, Tree& tree) {
    Reader(source, tree).readFile();
    tree.finish();
}

} // namespace kota::kvs
