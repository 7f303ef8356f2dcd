#pragma once

#include <utility>

namespace kota {

// Gives a variable another value for as long as a block runs, however it ends.
template <class Value>
class ValueScope {
public:
    ValueScope(Value& place, Value value) : place_(place), before_(std::exchange(place, value)) {}
    ~ValueScope() { place_ = before_; }
    ValueScope(const ValueScope&) = delete;
    ValueScope& operator=(const ValueScope&) = delete;

private:
    Value& place_;
    Value before_;
};

} // namespace kota
