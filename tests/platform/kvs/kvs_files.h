#pragma once

#include "platform/kvs/kvs.h"
#include "tests/support/temp_folder.h"

#include <gtest/gtest.h>

#include <string>
#include <string_view>

// What the tests of the file library share: a file loaded from a text, and a file being built.
namespace kvs_test {

using kota::test::TempFolder;

inline std::string stringOf(void* parameter) {
    return std::string(CString(kvsGetString(parameter)).View());
}

inline std::string errorText() {
    return std::string(kvsPeekErrorTextGlb().View());
}

// The error state is the library's: one test's failure is not the next one's.
class FileLibrary : public testing::Test {
protected:
    ~FileLibrary() override { kvsGetErrorGlb(); }
};

// A file's handle, closed at the end.
class Handle {
public:
    explicit Handle(void* file) : file_(file) {}
    ~Handle() { kvsClose(&file_); }
    Handle(const Handle&) = delete;
    Handle& operator=(const Handle&) = delete;

    operator void*() const { return file_; }

private:
    void* file_;
};

struct SyntaxError {
    int line = -1;
    int column = -1;
    std::string text;
};

// A text, loaded by way of a file of its own.
class Loaded {
public:
    explicit Loaded(const std::string& text)
        : path_(folder_.write("f.ad31", text)), file_(kvsLoadFile(path_.c_str(), 1)),
          failed_(kvsGetErrorGlb() != 0) {}

    bool failed() const { return failed_; }
    const std::string& path() const { return path_; }
    void* file() const { return file_; }

    SyntaxError error() const {
        SyntaxError error;
        CString text;
        kvsGetSyntaxErr(file_, &error.line, &error.column, &text);
        error.text = std::string(text.View());
        return error;
    }
    // The error's text without the path in front.
    std::string message() const {
        const std::string text = error().text;
        return text.starts_with(path_) ? text.substr(path_.size()) : "not after the path: " + text;
    }

    void* target(const char* name = "T", int number = 1) const {
        return kvsTargetByNameNum(file_, name, number);
    }

private:
    TempFolder folder_;
    std::string path_;
    Handle file_;
    bool failed_;
};

// The members of one section "S", loaded.
class LoadedSection : public Loaded {
public:
    explicit LoadedSection(const std::string& members)
        : Loaded("target T {\nsection S {\n" + members + "\n}\n}\n"),
          section_(kvsSectionByNameNum(target(), "S", 1)) {
        EXPECT_FALSE(failed()) << error().text;
    }

    void* section() const { return section_; }
    void* keyword(const char* name, int number = 1) const {
        return kvsKeywordByNameNum(section_, name, number);
    }
    void* parameter(const char* name, int place = 1) const { return kvsParamByNum(keyword(name), place); }
    int parameterCount(const char* name) const {
        int count = 0;
        while (kvsParamByNum(keyword(name), count + 1))
            ++count;
        return count;
    }

private:
    void* section_;
};

// One parameter, loaded.
class LoadedValue : public LoadedSection {
public:
    explicit LoadedValue(const std::string& value) : LoadedSection("v = " + value) {}

    void* get() const { return parameter("v"); }
};

// A file being built.
class Built {
public:
    void* file() const { return file_; }

    // The text that an append gives; what failed, in its place.
    std::string text() const {
        if (!kvsAppend(file_, folder_.file("f.ad31").c_str()))
            return "append failed: " + errorText();
        const std::string text = folder_.read("f.ad31");
        folder_.write("f.ad31", "");
        return text;
    }

private:
    TempFolder folder_;
    Handle file_{kvsCreate()};
};

// The same with a section "S" of a target "T" open.
class BuiltSection : public Built {
public:
    BuiltSection() {
        kvsAddTarget(file(), "T");
        kvsAddSection(file(), "S");
    }

    // The lines of the section, without their indentation.
    std::string lines() const {
        std::string text = this->text();
        const std::string head = "target T {\n  section S {\n";
        const std::string tail = "  }\n}\n";
        if (!text.starts_with(head) || !text.ends_with(tail))
            return text;
        text = text.substr(head.size(), text.size() - head.size() - tail.size());
        std::string lines;
        for (std::size_t at = 0; at < text.size();) {
            const std::size_t end = text.find('\n', at) + 1;
            const std::string line = text.substr(at, end - at);
            lines += line.starts_with("    ") ? line.substr(4) : "wrong indent:" + line;
            at = end;
        }
        return lines;
    }
};

} // namespace kvs_test
