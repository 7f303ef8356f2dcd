#include "platform/kvs/kvs.h"

#include "platform/framework/platform_texts.h"
#include "platform/kvs/reader.h"
#include "platform/kvs/text_file.h"
#include "platform/kvs/writer.h"

#include <algorithm>
#include <new>
#include <optional>

namespace {

using kota::kvs::Cell;
using kota::kvs::Section;

struct LoadError {
    int line = 0;
    int column = 0;
    std::string text;
};

// What a file's handle points at: a file that was read, or one that is being built.
struct File {
    std::optional<kota::kvs::Tree> tree;
    LoadError error;
    kota::kvs::Writer writer;
};

std::string globalError; // empty: none

std::string_view textOf(const char* name) {
    return name ? name : "";
}

LoadError load(const std::string& path, std::optional<kota::kvs::Tree>& tree) {
    try {
        kota::kvs::InputFile input;
        if (const std::string error = input.open(path.c_str()); !error.empty())
            return {0, 0, error};
        tree.emplace(input.size());
        kota::kvs::readText([&](char* to, std::size_t room) { return input.read(to, room); }, *tree);
        return {0, 0, input.error()};
    } catch (const kota::kvs::SyntaxError& syntax) {
        const std::string place = std::to_string(syntax.line) + ":" + std::to_string(syntax.column);
        return {syntax.line, syntax.column, path + ":" + place + ": " + syntax.what()};
    } catch (const std::bad_alloc&) {
        const CString message = kota::platformText(kota::PlatformText::NoMemoryToRead, path.c_str());
        return {0, 0, std::string(message.View())};
    }
}

// The file's writer, or null for a null handle.
kota::kvs::Writer* writerOf(void* file) {
    return file ? &static_cast<File*>(file)->writer : nullptr;
}

} // namespace

void* kvsLoadFile(const char* path, int /*mode*/) {
    auto file = std::make_unique<File>();
    file->error = load(path ? path : "", file->tree);
    if (!file->error.text.empty())
        file->tree.reset();
    globalError = file->error.text;
    return file.release();
}

int kvsPeekErrorGlb() {
    return globalError.empty() ? 0 : 1;
}

int kvsGetErrorGlb() {
    const int error = kvsPeekErrorGlb();
    globalError.clear();
    return error;
}

CString kvsPeekErrorTextGlb() {
    return CString(std::string_view(globalError));
}

int kvsGetSyntaxErr(void* file, int* line, int* column, CString* text) {
    const LoadError error = file ? static_cast<File*>(file)->error : LoadError{};
    if (line)
        *line = error.line;
    if (column)
        *column = error.column;
    if (text)
        *text = std::string_view(error.text);
    return error.text.empty() ? 0 : 1;
}

void* kvsTargetByNameNum(void* file, const char* name, int number) {
    if (!file || !static_cast<File*>(file)->tree)
        return nullptr;
    const Section* all = static_cast<File*>(file)->tree->fileSection();
    return const_cast<Section*>(all->section(textOf(name), number));
}

void* kvsSectionByNameNum(void* targetOrSection, const char* name, int number) {
    const auto* parent = static_cast<const Section*>(targetOrSection);
    return parent ? const_cast<Section*>(parent->section(textOf(name), number)) : nullptr;
}

void* kvsKeywordByNameNum(void* section, const char* name, int number) {
    const auto* parent = static_cast<const Section*>(section);
    return parent ? const_cast<Cell*>(parent->keyword(textOf(name), number)) : nullptr;
}

void* kvsParamByNum(void* keyword, int place) {
    return const_cast<Cell*>(kota::kvs::parameter(static_cast<const Cell*>(keyword), place));
}

int kvsGetInt(void* parameter) {
    return parameter ? static_cast<const Cell*>(parameter)->asInt() : 0;
}
double kvsGetDouble(void* parameter) {
    return parameter ? static_cast<const Cell*>(parameter)->asDouble() : 0;
}
bool kvsGetBool(void* parameter) {
    return parameter && static_cast<const Cell*>(parameter)->asBool();
}

const CString& kvsGetString(void* parameter) {
    static const CString none;
    return parameter ? static_cast<const Cell*>(parameter)->asString() : none;
}

namespace kota::kvs {

int getListParam(void* section, const char* keyword, int number, std::string_view format,
                 std::span<const Destination> destinations) {
    void* const found = kvsKeywordByNameNum(section, keyword, number);
    const std::size_t count = std::min(format.size(), destinations.size());
    int filled = 0;
    for (std::size_t i = 0; i < count; ++i) {
        const Destination& to = destinations[i];
        void* const parameter = kvsParamByNum(found, static_cast<int>(i) + 1);
        if (!parameter || format[i] != to.format)
            continue;
        if (to.intAddress)
            *to.intAddress = kvsGetInt(parameter);
        else if (to.doubleAddress)
            *to.doubleAddress = kvsGetDouble(parameter);
        else
            continue;
        ++filled;
    }
    return filled;
}

void putListParam(void* file, const char* keyword, std::string_view format, std::span<const Source> values) {
    kvsAddKeyword(file, keyword);
    const std::size_t count = std::min(format.size(), values.size());
    for (std::size_t i = 0; i < count; ++i) {
        const Source& source = values[i];
        const Cell value =
            source.format == 'i' ? Cell::ofInt(source.intValue) : Cell::ofDouble(source.doubleValue);
        if (format[i] == 'i')
            kvsAddInt(file, value.asInt());
        else
            kvsAddDouble(file, value.asDouble());
    }
}

} // namespace kota::kvs

void kvsClose(void** file) {
    if (!file)
        return;
    delete static_cast<File*>(*file);
    *file = nullptr;
}

void* kvsCreate() {
    return new File;
}

void kvsAddTarget(void* file, const char* name) {
    if (auto* writer = writerOf(file))
        writer->addTarget(textOf(name));
}

void kvsAddSection(void* file, const char* name) {
    if (auto* writer = writerOf(file))
        writer->addSection(textOf(name));
}

void kvsEndSection(void* file) {
    if (auto* writer = writerOf(file))
        writer->endSection();
}

void kvsAddKeyword(void* file, const char* name) {
    if (auto* writer = writerOf(file))
        writer->addKeyword(textOf(name));
}

void kvsAddInt(void* file, int value) {
    if (auto* writer = writerOf(file))
        writer->addInt(value);
}

void kvsAddDouble(void* file, double value) {
    if (auto* writer = writerOf(file))
        writer->addDouble(value);
}

void kvsAddBool(void* file, bool value) {
    if (auto* writer = writerOf(file))
        writer->addBool(value);
}

void kvsAddString(void* file, std::string_view value) {
    if (auto* writer = writerOf(file))
        writer->addString(value);
}

int kvsAppend(void* file, const char* path) {
    globalError.clear();
    kota::kvs::Writer* writer = writerOf(file);
    if (!writer)
        return 0;
    const auto& text = writer->finish();
    globalError = writer->misuse();
    if (globalError.empty())
        globalError = kota::kvs::appendText(path ? path : "", text);
    return globalError.empty() ? 1 : 0;
}
