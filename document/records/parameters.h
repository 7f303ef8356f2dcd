#pragma once

#include "platform/framework/text.h"
#include "platform/kvs/kvs.h"

#include <tuple>

// A record's form on file: its members in file order, as a constant beside the record's Save and Load, which
// both walk it. A member's type is its parameter's type; what is not a plain member is one of the marks
// below.
//
//     constexpr auto parameters = fileForm(&AD_Decay::componentNum, &AD_Decay::decayConst, LocationTriple());
namespace kota {

// An int that is a bool on file.
template <class Record>
struct BoolParameter {
    int Record::*member;
};

// The three parameters of a location: global or not, river name, chainage. Written by the record's virtual
// SaveLocation.
struct LocationTriple {};

template <class... Entry>
constexpr auto fileForm(Entry... entries) {
    return std::tuple(entries...);
}

template <class Record>
constexpr BoolParameter<Record> asBool(int Record::*member) {
    return {member};
}

// Where the parameters of one keyword go to.
class ParameterWriter {
public:
    explicit ParameterWriter(void* file) : file_(file) {}

    template <class Record, class Base>
    void operator()(Record& record, int Base::*member) const {
        kvsAddInt(file_, record.*member);
    }
    template <class Record, class Base>
    void operator()(Record& record, double Base::*member) const {
        kvsAddDouble(file_, record.*member);
    }
    template <class Record, class Base>
    void operator()(Record& record, CString Base::*member) const {
        kvsAddString(file_, (record.*member).View());
    }
    template <class Record, class Base>
    void operator()(Record& record, BoolParameter<Base> flag) const {
        kvsAddBool(file_, record.*flag.member != 0);
    }
    template <class Record>
    void operator()(Record& record, LocationTriple) const {
        record.SaveLocation(file_);
    }

private:
    void* file_;
};

// Where the parameters of one keyword come from, one after the other.
class ParameterReader {
public:
    explicit ParameterReader(void* keyword) : keyword_(keyword) {}

    template <class Record, class Base>
    void operator()(Record& record, int Base::*member) {
        record.*member = kvsGetInt(next());
    }
    template <class Record, class Base>
    void operator()(Record& record, double Base::*member) {
        record.*member = kvsGetDouble(next());
    }
    template <class Record, class Base>
    void operator()(Record& record, CString Base::*member) {
        record.*member = kvsGetString(next());
    }
    template <class Record, class Base>
    void operator()(Record& record, BoolParameter<Base> flag) {
        record.*flag.member = kvsGetBool(next()) ? 1 : 0;
    }

    // A global record has no place, whatever stands there.
    template <class Record>
    void operator()(Record& record, LocationTriple) {
        (*this)(record, asBool(&Record::isGlobal));
        if (record.isGlobal) {
            record.riverName.Empty();
            record.chainage = 0.0;
        } else {
            (*this)(record, &Record::riverName);
            (*this)(record, &Record::chainage);
        }
    }

private:
    void* next() { return kvsParamByNum(keyword_, ++place_); }

    void* keyword_;
    int place_ = 0;
};

// Starts a keyword with the record's parameters.
template <class Record, class Form>
void saveKeyword(void* file, const char* name, Record& record, const Form& form) {
    kvsAddKeyword(file, name);
    std::apply([&](auto... entry) { (ParameterWriter(file)(record, entry), ...); }, form);
}

// Reads the record's parameters; one that the keyword lacks reads as zero or empty.
template <class Record, class Form>
void loadKeyword(void* keyword, Record& record, const Form& form) {
    ParameterReader read(keyword);
    std::apply([&](auto... entry) { (read(record, entry), ...); }, form);
}

} // namespace kota
