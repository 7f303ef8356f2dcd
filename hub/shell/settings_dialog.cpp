#include "hub/shell/settings_dialog.h"

#include "hub/screen/text.h"
#include "hub/shell/menu.h"
#include "platform/foundation/units.h"

#include <QDialogButtonBox>
#include <QFormLayout>
#include <QGroupBox>
#include <QLabel>
#include <QVBoxLayout>

#include <array>
#include <utility>

namespace kota::hub {

namespace {

// The items that offer a choice, under the names that the user knows.
constexpr std::array<std::pair<int, HubText>, 4> items = {{{100143, HubText::UnitChainage},
                                                           {100147, HubText::UnitWidth},
                                                           {100155, HubText::UnitLayerHeight},
                                                           {100149, HubText::UnitRate}}};

QComboBox* unitChoice(int item, const QString& chosen) {
    auto* const choice = new QComboBox;
    for (const Unit& unit : findUnitItem(item)->units)
        choice->addItem(toQt(unit.symbol));
    choice->setCurrentText(chosen);
    return choice;
}

} // namespace

SettingsDialog::SettingsDialog(const Settings& settings, QWidget* parent)
    : QDialog(parent), language_(new QComboBox) {
    setWindowTitle(hubText(HubText::Settings));
    language_->addItem(hubText(HubText::LanguageOfEnvironment), 0);
    language_->addItem("English", 1033); // each in itself, for those who read no other
    language_->addItem("日本語", 1041);
    language_->setCurrentIndex(std::max(0, language_->findData(settings.language)));

    auto* const languages = new QFormLayout;
    languages->addRow(hubText(HubText::Language), language_);
    auto* const group = new QGroupBox(hubText(HubText::DisplayUnits));
    auto* const form = new QFormLayout;
    group->setLayout(form);
    for (const auto& [item, name] : items) {
        const auto chosen = settings.units.find(item);
        units_[item] = unitChoice(item, chosen == settings.units.end() ? QString() : chosen->second);
        form->addRow(hubText(name), units_[item]);
    }
    auto* const note = new QLabel(hubText(HubText::AtNextStart));
    note->setWordWrap(true);
    auto* const buttons = new QDialogButtonBox(QDialogButtonBox::Ok | QDialogButtonBox::Cancel);
    QObject::connect(buttons, &QDialogButtonBox::accepted, this, &QDialog::accept);
    QObject::connect(buttons, &QDialogButtonBox::rejected, this, &QDialog::reject);
    auto* const layout = new QVBoxLayout(this);
    layout->addLayout(languages);
    layout->addWidget(group);
    layout->addWidget(note);
    layout->addWidget(buttons);
}

Settings SettingsDialog::chosen() const {
    Settings settings;
    settings.language = language_->currentData().toInt();
    for (const auto& [item, choice] : units_)
        if (choice->currentIndex() > 0) // the first is the base unit
            settings.units[item] = choice->currentText();
    return settings;
}

} // namespace kota::hub
