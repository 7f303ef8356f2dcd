#pragma once

#include "hub/shell/exchange.h"

#include <QAbstractTableModel>
#include <QDateTime>

#include <deque>

namespace kota::hub {

// What a message of the exchange means, in the user's language.
QString meaningOf(const PassedMessage& message);

// The last messages of the exchange, the newest at the end.
class ExchangeModel : public QAbstractTableModel {
public:
    enum Column { Time, Code, Meaning, Sender, River, Chainage, Data, ColumnCount };
    static constexpr int most = 10000; // older ones are forgotten

    void add(const PassedMessage& message, const QDateTime& time = QDateTime::currentDateTime());
    void clear();

    int rowCount(const QModelIndex& parent = {}) const override;
    int columnCount(const QModelIndex& parent = {}) const override;
    QVariant data(const QModelIndex& index, int role) const override;
    QVariant headerData(int section, Qt::Orientation orientation, int role) const override;

private:
    struct Line {
        QDateTime time;
        PassedMessage message;
    };
    static QString textOf(const Line& line, int column);

    std::deque<Line> lines_;
};

} // namespace kota::hub
