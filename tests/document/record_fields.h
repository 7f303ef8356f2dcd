#pragma once

#include "tests/document/records/global_var_rows.h"
#include "tests/support/owned.h"

namespace kota::test {

// Which int of a record a visitor is shown.
enum class IntRole { Number, Flag, Component };

// Visitors have `integer(int&, IntRole)`, `real(double&)`, `text(CString&)` and `place(AD_Comp_RiverPos&)`,
// the last for the triple of a record that may be global. All that the file holds of a record is visited, in
// the order of its members.

template <class Visitor>
void visitFields(AD_Component& record, Visitor& visit) {
    visit.text(record.name);
    for (int* value : {&record.number, &record.units, &record.kind})
        visit.integer(*value, IntRole::Number);
}

template <class Visitor>
void visitFields(AD_Decay& record, Visitor& visit) {
    visit.integer(record.componentNum, IntRole::Component);
    visit.real(record.decayConst);
    visit.place(record);
}

template <class Visitor>
void visitFields(AD_Init_cond& record, Visitor& visit) {
    visit.integer(record.componentNum, IntRole::Component);
    visit.real(record.concentration);
    visit.place(record);
}

template <class Visitor>
void visitFields(AD_Init_cond_stra& record, Visitor& visit) {
    visit.integer(record.componentNum, IntRole::Component);
    for (double* value : {&record.concS, &record.conc2, &record.conc3, &record.concB, &record.k2, &record.k3})
        visit.real(*value);
    visit.place(record);
}

template <class Visitor>
void visitFields(AD_NonCohesiv_ST_Data& record, Visitor& visit) {
    visit.integer(record.componentNum, IntRole::Component);
    visit.real(record.grainSize);
    visit.real(record.stdDev);
    visit.place(record);
}

template <class Visitor>
void visitFields(AD_Dispersion& record, Visitor& visit) {
    visit.text(record.riverName);
    for (double* value :
         {&record.chainage, &record.dispFactor, &record.exponent, &record.minCoef, &record.maxCoef})
        visit.real(*value);
}

template <class Visitor>
void visitFields(AD_Dispersion_K32& record, Visitor& visit) {
    visit.text(record.riverName);
    for (double* value : {&record.chainage, &record.dispFactorTop, &record.dispFactorBottom,
                          &record.exponentTop, &record.exponentBottom, &record.minCoefTop,
                          &record.minCoefBottom, &record.maxCoefTop, &record.maxCoefBottom})
        visit.real(*value);
}

template <class Visitor>
void visitFields(AD_Ice_Data& record, Visitor& visit) {
    visit.text(record.riverName);
    for (double* value : {&record.chainage, &record.iceThickness, &record.iceWidth})
        visit.real(*value);
    visit.integer(record.quality, IntRole::Number);
}

template <class Visitor>
void visitFields(AD_Global_Const& record, Visitor& visit) {
    visit.integer(record.componentNum, IntRole::Component);
    visit.integer(record.instantErosion, IntRole::Flag);
    for (int* value : {&record.depShearMode, &record.eroShearMode})
        visit.integer(*value, IntRole::Number);
    for (double* value :
         {&record.cOffset, &record.g, &record.m, &record.w0, &record.swi, &record.timeCentering,
          &record.critShearDep, &record.critShearEro1, &record.critShearEro2, &record.critShearEro3,
          &record.eroCoef1, &record.eroCoef2, &record.eroCoef3, &record.eroExp1, &record.eroExp2,
          &record.eroExp3, &record.tran12, &record.tran23, &record.slidFrCoef})
        visit.real(*value);
    visit.place(record);
}

template <class Visitor>
void visitFields(AD_ST_Init_Cond_data& record, Visitor& visit) {
    visit.real(record.width);
    visit.real(record.layerHeight);
}

// The table is visited as a list of its own.
template <class Visitor>
void visitFields(AD_Cohesiv_ST_Init_Cond& record, Visitor& visit) {
    visit.integer(record.componentNum, IntRole::Component);
    for (double* value : {&record.height, &record.density, &record.potFac})
        visit.real(*value);
    visit.integer(record.useTable, IntRole::Flag);
    visit.integer(record.layer, IntRole::Number);
    visit.place(record);
    visit.list(record.adderList);
}

template <class Visitor>
void visitFields(AD_Global_Var& vars, Visitor& visit) {
    for (const GlobalInt& row : globalInts)
        visit.integer(vars.*row.member, IntRole::Number);
    for (const GlobalInt& row : globalFlags)
        visit.integer(vars.*row.member, IntRole::Flag);
    for (const GlobalDouble& row : globalDoubles)
        visit.real(vars.*row.member);
    eachFlagArray(vars, [&](const char*, auto& values) {
        for (int& value : values)
            visit.integer(value, IntRole::Number);
    });
    eachLayerPair(vars, [&](const char*, auto& values) {
        for (double& value : values)
            visit.real(value);
    });
}

// The global values and the ten lists that a file holds.
template <class Visitor>
void visitFields(CKota0_adDoc& document, Visitor& visit) {
    visitFields(document.globalVar, visit);
    visit.list(document.initList);
    visit.list(document.initStraList);
    visit.list(document.nonCohesList);
    visit.list(document.decayList);
    visit.list(document.dispersList);
    visit.list(document.iceDataList);
    visit.list(document.globalList);
    visit.list(document.compList);
    visit.list(document.layerList);
    visit.list(document.k32DispersList);
}

} // namespace kota::test
