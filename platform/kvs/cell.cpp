#include "platform/kvs/cell.h"

namespace kota::kvs {

std::int32_t Cell::asInt() const {
    switch (type()) {
    case Type::Int:
    case Type::Bool:
        return static_cast<std::int32_t>(value());
    case Type::Double: {
        const auto number = std::bit_cast<double>(bits_);
        const bool fits = number > -2147483649.0 && number < 2147483648.0;
        return fits ? static_cast<std::int32_t>(number) : 0;
    }
    default:
        return 0;
    }
}

double Cell::asDouble() const {
    return type() == Type::Double ? std::bit_cast<double>(bits_) : asInt();
}

bool Cell::asBool() const {
    return asDouble() == 1.0;
}

const CString& Cell::asString() const {
    static const CString none;
    return type() == Type::String ? *std::bit_cast<const CString*>(static_cast<std::uintptr_t>(value()))
                                  : none;
}

} // namespace kota::kvs
