#include "hub/shell/settings.h"

#include "hub/screen/text.h"
#include "platform/foundation/units.h"

#include <QSettings>

namespace kota::hub {

namespace {

constexpr const char* languageKey = "language";
constexpr const char* unitsGroup = "units";
constexpr int chainageItem = 100143;

const Unit& chainageUnit() {
    return findUnitItem(chainageItem)->units[static_cast<std::size_t>(displayUnit(chainageItem))];
}

} // namespace

Settings Settings::load() {
    QSettings stored;
    Settings settings;
    settings.language = stored.value(languageKey, 0).toInt();
    stored.beginGroup(unitsGroup);
    for (const QString& item : stored.childKeys())
        settings.units[item.toInt()] = stored.value(item).toString();
    return settings;
}

void Settings::save() const {
    QSettings stored;
    stored.setValue(languageKey, language);
    stored.remove(unitsGroup);
    stored.beginGroup(unitsGroup);
    for (const auto& [item, symbol] : units)
        stored.setValue(QString::number(item), symbol);
}

void Settings::applyUnits() const {
    for (const auto& [id, symbol] : units) {
        const UnitItem* const item = findUnitItem(id);
        for (std::size_t unit = 0; item && unit < item->units.size(); ++unit)
            if (toQt(item->units[unit].symbol) == symbol)
                setDisplayUnit(id, static_cast<int>(unit));
    }
}

QString chainageText(double metres) {
    const Unit& unit = chainageUnit();
    return QString::number(toDisplay(unit, metres), 'f', 0) + ' ' + toQt(unit.symbol);
}

double metresPerChainageUnit() {
    return toBase(chainageUnit(), 1);
}

} // namespace kota::hub
