#include "editing/base/unit_items.h"
#include "platform/foundation/units.h"
#include "tests/pages/tabs.h"

#include <rapidcheck.h>

#include <cstdint>
#include <functional>
#include <tuple>

namespace {

using kota::test::ColumnLook;
using kota::test::looksOf;
using kota::test::recordOf;
using kota::test::recordsOf;
using testing::ElementsAre;

// The display units of chainage and of first-order rates, as positions in the catalogue.
struct Units {
    int chainage = 0;
    int rate = 0;
};
constexpr Units feetAndDays{1, 1};

// Sets the units, and sets the base units again when it goes.
class UnitsScope {
public:
    explicit UnitsScope(Units units) { set(units); }
    ~UnitsScope() { set({}); }
    UnitsScope(const UnitsScope&) = delete;
    UnitsScope& operator=(const UnitsScope&) = delete;

private:
    static void set(Units units) {
        EXPECT_TRUE(kota::setDisplayUnit(UnitItem::Chainage, units.chainage));
        EXPECT_TRUE(kota::setDisplayUnit(UnitItem::FirstOrderRate, units.rate));
    }
};

// The units stand before the pages are made.
class InUnits : private UnitsScope, public kota::test::OnATab {
protected:
    InUnits(Units units, const char* tab, std::vector<std::string> rivers = {})
        : UnitsScope(units), OnATab(tab, std::move(rivers)) {}
};

class TheDecayPageInFeetAndDays : public InUnits {
protected:
    TheDecayPageInFeetAndDays() : InUnits(feetAndDays, "Decay") {}
};

TEST_F(TheDecayPageInFeetAndDays, NamesTheUnits) {
    EXPECT_EQ(looksOf(grid())[1].toolTip, "Unit: 1/day");
    EXPECT_EQ(looksOf(grid())[4].toolTip, "Unit: ft");
}

TEST_F(TheDecayPageInFeetAndDays, ShowsRecordsInTheUnitsAndStoresThemInTheBaseUnits) {
    document().decayList.DeleteAll();
    kota::test::addLocal(document().decayList, 0, "NILE", 304.8).decayConst = 0.5;
    fill();
    EXPECT_THAT(line(1), ElementsAre("0", "12.000000", "0", "NILE", "1000.000000"));
    put(1, 2, "24");
    put(1, 5, "500");
    EXPECT_EQ(recordOf(document().decayList).decayConst, 1.0);
    EXPECT_EQ(recordOf(document().decayList).chainage, 152.4);
}

TEST_F(TheDecayPageInFeetAndDays, ConvertsNoChainageThatIsNotGiven) {
    document().decayList.DeleteAll();
    kota::test::addLocal(document().decayList, 0, "NILE", notGiven);
    fill();
    EXPECT_EQ(user->held(1, 5), "");
    store();
    EXPECT_EQ(recordOf(document().decayList).chainage, notGiven);
}

TEST_F(TheDecayPageInFeetAndDays, ConvertsThePlaceThatTheShellOffers) {
    shell().project().offers.push_back({.riverName = "NILE", .chainage2 = 304.8});
    ASSERT_TRUE(user->key(VK_INSERT));
    EXPECT_EQ(user->held(2, 5), "1000.000000.3");
    EXPECT_EQ(recordOf(document().decayList, 2).chainage, 304.8);
}

class TheDispersionPageInFeet : public InUnits {
protected:
    TheDispersionPageInFeet() : InUnits(feetAndDays, "Dispersion", {"NILE"}) {
        document().dispersList.DeleteAll();
        kota::test::addLocal(document().dispersList, 0, "", 1.0);
        kota::test::addLocal(document().dispersList, 0, "NILE", 304.8).maxCoef = 7.0;
        fill();
    }
};

TEST_F(TheDispersionPageInFeet, ConvertsTheChainageAlone) {
    EXPECT_EQ(looksOf(grid())[1].toolTip, "Unit: ft");
    EXPECT_THAT(line(2), ElementsAre("NILE", "1000.000000", "0.000000", "0.000000", "0.000000", "7.000000"));
    put(2, 2, "500");
    EXPECT_EQ(recordOf(document().dispersList, 2).chainage, 152.4);
    EXPECT_EQ(recordOf(document().dispersList, 2).maxCoef, 7.0);
}

TEST_F(TheDispersionPageInFeet, ReportsALocationInTheBaseUnit) {
    ASSERT_TRUE(user->putCursor(1, 1));
    shell().forgetReceived();
    ASSERT_TRUE(user->putCursor(2, 1));
    ASSERT_EQ(shell().received(503).size(), 1U);
    EXPECT_EQ(shell().received(503).front().location.value().chainage, 304.8);
}

using Components = std::vector<std::tuple<int, std::string, int, int>>;
using Decays = std::vector<std::tuple<int, double, int, std::string, double>>;
using Dispersions = std::vector<std::tuple<std::string, double, double, double, double, double>>;

std::string text(const CString& bytes) {
    return std::string(bytes.View());
}

Components componentsOf(const CKota0_adDoc& document) {
    Components all;
    for (const AD_Component* c : recordsOf(document.compList))
        all.emplace_back(c->number, text(c->name), c->units, c->kind);
    return all;
}
Decays decaysOf(const CKota0_adDoc& document) {
    Decays all;
    for (const AD_Decay* d : recordsOf(document.decayList))
        all.emplace_back(d->componentNum, d->decayConst, d->isGlobal, text(d->riverName), d->chainage);
    return all;
}
Dispersions dispersionsOf(const CKota0_adDoc& document) {
    Dispersions all;
    for (const AD_Dispersion* d : recordsOf(document.dispersList))
        all.emplace_back(text(d->riverName), d->chainage, d->dispFactor, d->exponent, d->minCoef, d->maxCoef);
    return all;
}

// A number of at most six decimals, as the cells hold it.
double anyNumber() {
    constexpr std::int64_t most = 100'000'000'000'000;
    return static_cast<double>(*rc::gen::inRange(-most, most)) / 1e6;
}
double anyChainage() {
    return *rc::gen::arbitrary<bool>() ? anyNumber() : notGiven;
}
std::string anyName() {
    return *rc::gen::element<std::string>("", "NILE", "gudenå", " a b ", "1", "\"'", "ÅØ\t", "x\xFFy");
}
std::size_t anyCount() {
    return *rc::gen::inRange<std::size_t>(1, 6);
}

void makeComponents(CKota0_adDoc& document) {
    document.compList.DeleteAll();
    const std::size_t count = anyCount();
    for (std::size_t n = 1; n <= count; ++n) {
        AD_Component& component = kota::test::addTo(document.compList);
        component.number = static_cast<int>(n);
        component.name = count == 1 ? std::string("ONLY") : anyName();
        component.units = *rc::gen::arbitrary<int>();
        component.kind = *rc::gen::arbitrary<int>();
    }
}
void makeDecays(CKota0_adDoc& document) {
    document.decayList.DeleteAll();
    for (std::size_t left = anyCount(); left > 0; --left) {
        const bool isGlobal = *rc::gen::arbitrary<bool>();
        AD_Decay& decay = kota::test::addTo(document.decayList);
        decay.componentNum = *rc::gen::arbitrary<int>();
        decay.decayConst = anyNumber();
        decay.isGlobal = isGlobal;
        decay.riverName = isGlobal ? std::string() : anyName();
        decay.chainage = isGlobal ? notGiven : anyChainage();
    }
}
void makeDispersions(CKota0_adDoc& document) {
    document.dispersList.DeleteAll();
    for (std::size_t left = anyCount(); left > 0; --left) {
        AD_Dispersion& dispersion = kota::test::addTo(document.dispersList);
        dispersion.riverName = anyName();
        dispersion.chainage = anyChainage();
        for (double AD_Dispersion::*value : {&AD_Dispersion::dispFactor, &AD_Dispersion::exponent,
                                             &AD_Dispersion::minCoef, &AD_Dispersion::maxCoef})
            dispersion.*value = anyNumber();
    }
}

// A list that a tab shows: random records for it, and its records as values.
struct List {
    const char* tab;
    void (*make)(CKota0_adDoc&);
    bool (*isSame)(const CKota0_adDoc& document, const std::function<void()>& change);
};

template <auto recordsIn>
bool isSameAfter(const CKota0_adDoc& document, const std::function<void()>& change) {
    const auto before = recordsIn(document);
    change();
    return recordsIn(document) == before;
}

constexpr List lists[] = {{"Components", makeComponents, isSameAfter<componentsOf>},
                          {"Decay", makeDecays, isSameAfter<decaysOf>},
                          {"Dispersion", makeDispersions, isSameAfter<dispersionsOf>}};

class AnyDocument : public InUnits, public testing::WithParamInterface<std::tuple<List, Units>> {
protected:
    AnyDocument() : InUnits(std::get<Units>(GetParam()), list().tab) {}

    static const List& list() { return std::get<List>(GetParam()); }
    void fillAndStore() {
        fill();
        store();
    }
};

class AnyDocumentInBaseUnits : public AnyDocument {};

TEST_P(AnyDocumentInBaseUnits, IsTheSameAfterAFillAndAStore) {
    EXPECT_TRUE(rc::check([this] {
        list().make(document());
        RC_ASSERT(list().isSame(document(), [this] { fillAndStore(); }));
    }));
}

TEST_P(AnyDocument, IsTheSameAfterASecondFillAndStore) {
    EXPECT_TRUE(rc::check([this] {
        list().make(document());
        fillAndStore();
        RC_ASSERT(list().isSame(document(), [this] { fillAndStore(); }));
    }));
}

std::string nameOf(const testing::TestParamInfo<std::tuple<List, Units>>& info) {
    const auto& [list, units] = info.param;
    return std::string(list.tab) + (units.chainage ? "InFeet" : "InMetres") +
           (units.rate ? "AndDays" : "AndHours");
}

INSTANTIATE_TEST_SUITE_P(OfEachList, AnyDocumentInBaseUnits,
                         testing::Combine(testing::ValuesIn(lists), testing::Values(Units{})), nameOf);
INSTANTIATE_TEST_SUITE_P(OfEachListInAllUnits, AnyDocument,
                         testing::Combine(testing::ValuesIn(lists),
                                          testing::Values(Units{0, 0}, Units{1, 0}, Units{0, 1},
                                                          feetAndDays)),
                         nameOf);

} // namespace
