#include "platform/kvs/cell.h"

namespace kota::kvs {

Cell Cell::keyword(std::uint32_t group) {
    return {Type::Keyword, 0, Head{group, 0}};
}
Cell Cell::ofInt(std::int32_t value) {
    return {Type::Int, 0, value};
}
Cell Cell::ofDouble(double value) {
    return {Type::Double, 0, value};
}
Cell Cell::ofBool(bool value) {
    return {Type::Bool, 0, static_cast<std::int32_t>(value)};
}

Cell Cell::ofString(std::string_view value) {
    return {Type::String, static_cast<std::uint32_t>(value.size()), value.data()};
}

void Cell::countParameter() {
    Head head = payload<Head>();
    ++head.parameterCount;
    std::memcpy(payload_, &head, sizeof head);
}

std::int32_t Cell::asInt() const {
    switch (type()) {
    case Type::Int:
    case Type::Bool:
        return payload<std::int32_t>();
    case Type::Double: {
        const auto value = payload<double>();
        const bool fits = value > -2147483649.0 && value < 2147483648.0;
        return fits ? static_cast<std::int32_t>(value) : 0;
    }
    default:
        return 0;
    }
}

double Cell::asDouble() const {
    return type() == Type::Double ? payload<double>() : asInt();
}

bool Cell::asBool() const {
    return asDouble() == 1.0;
}

std::string_view Cell::asString() const {
    if (type() != Type::String)
        return {};
    return {payload<const char*>(), length()};
}

} // namespace kota::kvs
