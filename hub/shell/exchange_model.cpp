#include "hub/shell/exchange_model.h"

#include "hub/shell/menu.h"

#include <array>

namespace kota::hub {

namespace {

constexpr std::array headings = {HubText::ColumnTime,   HubText::ColumnCode,  HubText::ColumnMeaning,
                                 HubText::ColumnSender, HubText::ColumnRiver, HubText::ColumnChainage,
                                 HubText::ColumnData};
static_assert(headings.size() == ExchangeModel::ColumnCount);

// By their numbers.
constexpr std::array dataTypes = {HubText::DataInit,  HubText::DataSediment, HubText::DataNonCohesive,
                                  HubText::DataLayer, HubText::DataDecay,    HubText::DataDispersion,
                                  HubText::DataIce,   HubText::DataBoundary};

QString dataTypeText(int type) {
    const auto place = static_cast<std::size_t>(type);
    const QString number = QString::number(type);
    return type >= 0 && place < dataTypes.size() ? number + " " + hubText(dataTypes[place]) : number;
}

std::optional<HubText> switchBoardMeaning(WPARAM code) {
    switch (code) {
    case SwitchBoardCode::LeaveProject:
        return HubText::LeavesProject;
    case SwitchBoardCode::JoinProject:
        return HubText::JoinsProject;
    case SwitchBoardCode::OfferRivers:
        return HubText::AsksForRivers;
    case SwitchBoardCode::OfferLocation:
        return HubText::AsksForLocation;
    default:
        return std::nullopt;
    }
}

std::optional<HubText> knownMeaning(const PassedMessage& message) {
    if (message.message == switchBoardMessage())
        return switchBoardMeaning(message.code);
    if (message.message == showToolbarMessage())
        return HubText::ShowsToolBar;
    if (message.message == hideToolbarMessage())
        return HubText::HidesToolBar;
    if (message.code == CommunicationCode::LocationChanged)
        return HubText::LocationChanged;
    if (message.code == CommunicationCode::DataChanged)
        return HubText::DataChanged;
    return std::nullopt;
}

} // namespace

QString meaningOf(const PassedMessage& message) {
    return hubText(knownMeaning(message).value_or(HubText::UnknownCode));
}

void ExchangeModel::add(const PassedMessage& message, const QDateTime& time) {
    if (rowCount() >= most) {
        beginRemoveRows({}, 0, 0);
        lines_.pop_front();
        endRemoveRows();
    }
    beginInsertRows({}, rowCount(), rowCount());
    lines_.push_back({time, message});
    endInsertRows();
}

void ExchangeModel::clear() {
    beginResetModel();
    lines_.clear();
    endResetModel();
}

int ExchangeModel::rowCount(const QModelIndex& parent) const {
    return parent.isValid() ? 0 : static_cast<int>(lines_.size());
}

int ExchangeModel::columnCount(const QModelIndex& parent) const {
    return parent.isValid() ? 0 : ColumnCount;
}

QString ExchangeModel::textOf(const Line& line, int column) {
    const PassedMessage& message = line.message;
    switch (column) {
    case Time:
        return line.time.toString("HH:mm:ss.zzz");
    case Code:
        return QString::number(message.code);
    case Meaning:
        return meaningOf(message);
    case Sender:
        return message.sender;
    case River:
        return message.place ? message.place->river : QString();
    case Chainage:
        return message.place ? QString::number(message.place->chainage, 'f', 3) : QString();
    default:
        return message.dataType ? dataTypeText(*message.dataType) : QString();
    }
}

QVariant ExchangeModel::data(const QModelIndex& index, int role) const {
    if (role == Qt::TextAlignmentRole && (index.column() == Code || index.column() == Chainage))
        return QVariant::fromValue(Qt::AlignRight | Qt::AlignVCenter);
    if (role != Qt::DisplayRole || index.row() >= rowCount())
        return {};
    return textOf(lines_[static_cast<std::size_t>(index.row())], index.column());
}

QVariant ExchangeModel::headerData(int section, Qt::Orientation orientation, int role) const {
    if (role != Qt::DisplayRole || orientation != Qt::Horizontal)
        return QAbstractTableModel::headerData(section, orientation, role);
    return hubText(headings[static_cast<std::size_t>(section)]);
}

} // namespace kota::hub
