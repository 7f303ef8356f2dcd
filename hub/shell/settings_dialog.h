#pragma once

#include "hub/shell/settings.h"

#include <QComboBox>
#include <QDialog>

#include <map>

namespace kota::hub {

// Asks for the settings: the language, and the display unit of each item that has a choice.
class SettingsDialog : public QDialog {
public:
    explicit SettingsDialog(const Settings& settings, QWidget* parent = nullptr);

    // As the user has chosen so far.
    Settings chosen() const;

private:
    QComboBox* language_;
    std::map<int, QComboBox*> units_; // by item
};

} // namespace kota::hub
