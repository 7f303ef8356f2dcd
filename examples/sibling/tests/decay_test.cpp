#include "decay.h"

#include "document/records/component.h"
#include "document/records/decay.h"

#include <gtest/gtest.h>

namespace {

// An AD document that no template made: whoever made it empties it before it goes.
class AnAdDocument : public testing::Test {
protected:
    AnAdDocument() {
        add("BOD", 1);
        add("DYE", 2);
    }
    ~AnAdDocument() override { document.DeleteContents(); }

    void add(const char* name, int number) {
        auto* const component = new AD_Component; // the list's from now on
        component->name = name;
        component->number = number;
        document.compList.AddTail(component);
    }

    AD_Decay& addGlobal(int component, double decayConst) {
        auto* const line = new AD_Decay;
        line->componentNum = component;
        line->isGlobal = 1;
        line->decayConst = decayConst;
        document.decayList.AddTail(line);
        return *line;
    }

    AD_Decay& addLocal(int component, const char* river, double chainage, double decayConst) {
        AD_Decay& line = addGlobal(component, decayConst);
        line.isGlobal = 0;
        line.riverName = river;
        line.chainage = chainage;
        return line;
    }

    CKota0_adDoc document;
};

TEST(TheDecayFactor, IsOneWhereTheTemperatureStays) {
    EXPECT_EQ(water::decayFactor(17.0, 17.0), 1.0);
}

TEST(TheDecayFactor, GrowsWithTheTemperature) {
    EXPECT_NEAR(water::decayFactor(20.0, 21.0), 1.047, 1e-12);
    EXPECT_NEAR(water::decayFactor(20.0, 30.0), 1.5829, 1e-4);
    EXPECT_NEAR(water::decayFactor(20.0, 10.0) * water::decayFactor(10.0, 20.0), 1.0, 1e-12);
}

TEST_F(AnAdDocument, IsSummedUpByComponent) {
    addGlobal(1, 0.02);
    addLocal(1, "MISSOURI", 1000.0, 0.01);
    addLocal(1, "MISSOURI", 2000.0, 0.03);
    addGlobal(2, 7.0);

    const water::DecaySummary bod = water::summaryOf(document, "BOD");

    EXPECT_EQ(bod.lines, 3);
    EXPECT_EQ(bod.least, 0.01);
    EXPECT_EQ(bod.most, 0.03);
    EXPECT_EQ(water::summaryOf(document, "SALT").lines, 0);
}

TEST_F(AnAdDocument, HasTheDecayOfAPlaceOrElseTheGlobalOne) {
    addLocal(1, "MISSOURI", 1000.0, 0.01);
    addGlobal(1, 0.02);

    EXPECT_EQ(water::decayAt(document, "BOD", "MISSOURI", 1000.0), 0.01);
    EXPECT_EQ(water::decayAt(document, "BOD", "PLATTE", 1000.0), 0.02);
    EXPECT_EQ(water::decayAt(document, "DYE", "MISSOURI", 1000.0), std::nullopt);
}

TEST_F(AnAdDocument, ChangesForOneComponentAlone) {
    const AD_Decay& bod = addGlobal(1, 0.02);
    const AD_Decay& dye = addGlobal(2, 0.5);
    const AD_Decay& nobodys = addGlobal(0, 0.5);

    water::multiplyDecay(document, "BOD", 2.0);

    EXPECT_EQ(bod.decayConst, 0.04);
    EXPECT_EQ(dye.decayConst, 0.5);
    EXPECT_EQ(nobodys.decayConst, 0.5);
}

} // namespace
