#pragma once

#include "platform/framework/text.h"

#include <bit>
#include <cstdint>
#include <limits>

namespace kota::kvs {

// One element of a file's values: a parameter, or the head of a keyword, behind which its parameters stand.
//
// Eight bytes, since a big file is millions of these and little else. A double stands for itself; every other
// type stands in the bits of a NaN that no double of a file has: its type in the 16 bits on top, its value in
// the 48 below.
class Cell {
public:
    enum class Type : std::uint16_t { Double = 0, Int = 0xFFF9, Bool = 0xFFFA, String = 0xFFFB };

    // The head of a keyword, by the number of its name. It has no type.
    static Cell keyword(std::uint32_t name) { return Cell(name); }
    static Cell ofInt(std::int32_t value) { return boxed(Type::Int, static_cast<std::uint32_t>(value)); }
    static Cell ofBool(bool value) { return boxed(Type::Bool, value ? 1 : 0); }
    static Cell ofDouble(double value) {
        const bool isNan = value != value;
        return Cell(std::bit_cast<std::uint64_t>(isNan ? std::numeric_limits<double>::quiet_NaN() : value));
    }
    // `value` must outlive the cell.
    static Cell ofString(const CString& value) {
        return boxed(Type::String, std::bit_cast<std::uintptr_t>(&value));
    }

    // Of a keyword's head alone.
    std::uint32_t name() const { return static_cast<std::uint32_t>(bits_); }
    std::uint32_t parameterCount() const { return static_cast<std::uint32_t>(bits_ >> 32); }
    void setParameterCount(std::uint32_t count) { bits_ = std::uint64_t{count} << 32 | name(); }

    // Of a parameter alone.
    Type type() const {
        const auto top = static_cast<std::uint16_t>(bits_ >> valueBits);
        return top >= static_cast<std::uint16_t>(Type::Int) ? Type{top} : Type::Double;
    }
    // The parameter's natural value as another type, and zero, false or "" where there is none.
    std::int32_t asInt() const;
    double asDouble() const;
    bool asBool() const;
    const CString& asString() const;

private:
    static constexpr int valueBits = 48;

    explicit Cell(std::uint64_t bits) : bits_(bits) {}
    static Cell boxed(Type type, std::uint64_t value) {
        return Cell(static_cast<std::uint64_t>(type) << valueBits | value);
    }

    std::uint64_t value() const { return bits_ & ((std::uint64_t{1} << valueBits) - 1); }

    std::uint64_t bits_;
};

} // namespace kota::kvs
