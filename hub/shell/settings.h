#pragma once

#include <QString>

#include <map>

namespace kota::hub {

// What the user has chosen for the program as a whole. It takes effect when the program starts.
struct Settings {
    int language = 0;             // 1033 English, 1041 Japanese; 0: that of the environment
    std::map<int, QString> units; // by unit item, the symbol of its display unit; else the base unit

    // From the user's settings, and into them.
    static Settings load();
    void save() const;
    // Sets the units for the rest of the process. A symbol that an item does not have is passed over.
    void applyUnits() const;

    friend bool operator==(const Settings&, const Settings&) = default;
};

// A chainage in metres as the user reads it, in the display unit, with its symbol; and that unit in metres.
QString chainageText(double metres);
double metresPerChainageUnit();

} // namespace kota::hub
