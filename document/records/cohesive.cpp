#include "document/records/cohesive.h"

#include "document/records/parameters.h"

namespace {

using Record = AD_Global_Const;

template <class Form>
struct Keyword {
    const char* name;
    Form form;
};
template <class Form>
Keyword(const char*, Form) -> Keyword<Form>;

// The record on file: its keywords in their order, each with its parameters.
constexpr auto keywords = std::tuple(
    Keyword{"PRIVATE", kota::fileForm(&Record::componentNum)},
    Keyword{"SETTING", kota::fileForm(&Record::cOffset, &Record::g, &Record::m, &Record::w0, &Record::swi)},
    Keyword{"DEPOSITION",
            kota::fileForm(&Record::timeCentering, &Record::critShearDep, &Record::depShearMode)},
    Keyword{"EROSION", kota::fileForm(kota::asBool(&Record::instantErosion), &Record::critShearEro1,
                                      &Record::critShearEro2, &Record::critShearEro3, &Record::eroCoef1,
                                      &Record::eroCoef2, &Record::eroCoef3, &Record::eroExp1,
                                      &Record::eroExp2, &Record::eroExp3, &Record::eroShearMode)},
    Keyword{"CONSOLIDATION", kota::fileForm(&Record::tran12, &Record::tran23, &Record::slidFrCoef)},
    Keyword{"LOCATION", kota::fileForm(kota::LocationTriple())});

} // namespace

AD_Global_Const::AD_Global_Const() {
    isGlobal = 1;
}
AD_Global_Const::~AD_Global_Const() = default;

void AD_Global_Const::Save(void* file) {
    std::apply([&](auto... keyword) { (kota::saveKeyword(file, keyword.name, *this, keyword.form), ...); },
               keywords);
}

void AD_Global_Const::Load(void* section) {
    const auto load = [&](const auto& keyword) {
        kota::loadKeyword(kvsKeywordByNameNum(section, keyword.name, 1), *this, keyword.form);
    };
    std::apply([&](auto... keyword) { (load(keyword), ...); }, keywords);
}
