#include "tests/plugin/exported_names.h"

#include "tests/support/temp_folder.h"

#include <elf.h>
#include <link.h>

#include <cstring>
#include <stdexcept>
#include <vector>

namespace kota::test {

namespace {

// The rows of a table that begins at a place of the file.
template <class Row>
std::vector<Row> rowsAt(const std::string& file, std::size_t place, std::size_t count) {
    const std::size_t size = count * sizeof(Row);
    if (place > file.size() || size > file.size() - place)
        throw std::runtime_error("the library ends too early");
    std::vector<Row> rows(count);
    std::memcpy(rows.data(), file.data() + place, size);
    return rows;
}

bool isExported(const ElfW(Sym) & symbol) {
    const auto visibility = ELF64_ST_VISIBILITY(symbol.st_other);
    return symbol.st_shndx != SHN_UNDEF && ELF64_ST_BIND(symbol.st_info) != STB_LOCAL &&
           (visibility == STV_DEFAULT || visibility == STV_PROTECTED);
}

} // namespace

std::set<std::string> exportedNames(const std::string& path) {
    const std::string file = readFile(path);
    const auto header = rowsAt<ElfW(Ehdr)>(file, 0, 1)[0];
    const auto sections = rowsAt<ElfW(Shdr)>(file, header.e_shoff, header.e_shnum);
    std::set<std::string> names;
    for (const auto& section : sections) {
        if (section.sh_type != SHT_DYNSYM)
            continue;
        const std::size_t texts = sections.at(section.sh_link).sh_offset;
        for (const auto& symbol :
             rowsAt<ElfW(Sym)>(file, section.sh_offset, section.sh_size / sizeof(ElfW(Sym))))
            if (isExported(symbol))
                names.insert(file.c_str() + texts + symbol.st_name);
    }
    return names;
}

} // namespace kota::test
