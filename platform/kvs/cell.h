#pragma once

#include <cstdint>
#include <cstring>
#include <string_view>

namespace kota::kvs {

// One element of a file's values: a parameter, or the head of a keyword, behind which its parameters stand.
// Twelve bytes, since a big file is millions of these and little else.
class Cell {
public:
    enum class Type : std::uint32_t { Keyword, Int, Double, Bool, String };

    static constexpr std::uint32_t longestString = (1u << 29) - 1;

    // The head of a keyword with no parameters yet, in a group of the name index.
    static Cell keyword(std::uint32_t group);
    static Cell ofInt(std::int32_t value);
    static Cell ofDouble(double value);
    static Cell ofBool(bool value);
    // `value` is not copied; it is longestString bytes at the most.
    static Cell ofString(std::string_view value);

    Type type() const { return static_cast<Type>(typeAndLength_ & ((1u << typeBits) - 1)); }

    // Of a keyword's head alone.
    std::uint32_t group() const { return payload<Head>().group; }
    std::uint32_t parameterCount() const { return payload<Head>().parameterCount; }
    void countParameter();

    // The parameter's natural value as another type, and zero, false or "" where there is none.
    std::int32_t asInt() const;
    double asDouble() const;
    bool asBool() const;
    std::string_view asString() const;

private:
    struct Head {
        std::uint32_t group;
        std::uint32_t parameterCount;
    };

    template<class Value>
    Cell(Type type, std::uint32_t length, Value value)
        : typeAndLength_(length << typeBits | static_cast<std::uint32_t>(type)), payload_{} {
        static_assert(sizeof(Value) <= sizeof(payload_));
        std::memcpy(payload_, &value, sizeof value);
    }

    template<class Value>
    Value payload() const {
        Value value;
        std::memcpy(&value, payload_, sizeof value);
        return value;
    }

    static constexpr int typeBits = 3;

    std::uint32_t length() const { return typeAndLength_ >> typeBits; }

    std::uint32_t typeAndLength_; // the length is a string's
    unsigned char payload_[8];
};

static_assert(sizeof(Cell) == 12);

} // namespace kota::kvs
