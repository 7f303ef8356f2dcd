#pragma once

#include "hub/screen/dock.h"
#include "hub/shell/exchange_model.h"

#include <QLineEdit>
#include <QSortFilterProxyModel>
#include <QTableView>

namespace kota::hub {

// Shows the messages of the exchange as they pass, to be filtered, copied and cleared.
class ExchangeDock : public Dock {
public:
    ExchangeDock();

    // While the newest message is in view, it stays so.
    void add(const PassedMessage& message);
    // The selected messages as lines of cells parted by tabs, or all that pass the filter.
    QString copyText() const;

protected:
    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    void copy() const;

    ExchangeModel model_;
    QSortFilterProxyModel filtered_;
    QLineEdit filter_;
    QTableView view_;
};

} // namespace kota::hub
