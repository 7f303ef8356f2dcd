#include "hub/shell/exchange_dock.h"

#include "hub/shell/commands.h"
#include "hub/shell/menu.h"

#include <QApplication>
#include <QBoxLayout>
#include <QClipboard>
#include <QHeaderView>
#include <QKeyEvent>
#include <QPushButton>
#include <QScrollBar>

#include <algorithm>
#include <array>

namespace kota::hub {

namespace {

// As long as the texts that are usual in the columns; the meanings are measured.
constexpr std::array samples = {"00:00:00.000", "00000",         "", "document.AD31", "LITTLE MISSOURI",
                                "000000.000",   "0 Non Cohesive"};

int widestMeaning(const QFontMetrics& metrics) {
    int width = 0;
    for (const HubText meaning :
         {HubText::LeavesProject, HubText::JoinsProject, HubText::AsksForRivers, HubText::AsksForLocation,
          HubText::LocationChanged, HubText::DataChanged, HubText::ShowsToolBar, HubText::HidesToolBar})
        width = std::max(width, metrics.horizontalAdvance(hubText(meaning)));
    return width;
}

} // namespace

ExchangeDock::ExchangeDock() : Dock(HubCommand::ShowExchange, hubText(HubText::Exchange)) {
    setObjectName("exchange");
    filtered_.setSourceModel(&model_);
    filtered_.setFilterKeyColumn(-1); // all
    filtered_.setFilterCaseSensitivity(Qt::CaseInsensitive);
    view_.setModel(&filtered_);
    view_.setSelectionBehavior(QAbstractItemView::SelectRows);
    view_.setEditTriggers(QAbstractItemView::NoEditTriggers);
    view_.setTabKeyNavigation(false);
    view_.verticalHeader()->hide();
    view_.verticalHeader()->setDefaultSectionSize(view_.fontMetrics().height() + 4);
    view_.horizontalHeader()->setStretchLastSection(true);
    constexpr int margins = 24;
    const QFontMetrics metrics = view_.fontMetrics();
    for (int column = 0; column < ExchangeModel::ColumnCount; ++column)
        view_.setColumnWidth(column,
                             metrics.horizontalAdvance(samples[static_cast<std::size_t>(column)]) + margins);
    view_.setColumnWidth(ExchangeModel::Meaning, widestMeaning(metrics) + margins);
    view_.setAccessibleName(hubText(HubText::Exchange));
    view_.installEventFilter(this);

    filter_.setPlaceholderText(hubText(HubText::Filter));
    filter_.setAccessibleName(hubText(HubText::Filter));
    filter_.setClearButtonEnabled(true);
    QObject::connect(&filter_, &QLineEdit::textChanged, &filtered_,
                     &QSortFilterProxyModel::setFilterFixedString);
    auto* const copies = new QPushButton(hubText(HubText::CopyMessages));
    QObject::connect(copies, &QPushButton::clicked, this, [this] { copy(); });
    auto* const clears = new QPushButton(hubText(HubText::ClearMessages));
    QObject::connect(clears, &QPushButton::clicked, this, [this] { model_.clear(); });

    auto* const commands = new QHBoxLayout;
    commands->addWidget(&filter_, 1);
    commands->addWidget(copies);
    commands->addWidget(clears);
    auto* const content = new QWidget;
    auto* const layout = new QVBoxLayout(content);
    layout->setContentsMargins(6, 6, 6, 6);
    layout->addLayout(commands);
    layout->addWidget(&view_);
    fill(*content, view_);
}

void ExchangeDock::add(const PassedMessage& message) {
    const QScrollBar& bar = *view_.verticalScrollBar();
    const bool isAtEnd = bar.value() == bar.maximum();
    model_.add(message);
    if (isAtEnd)
        view_.scrollToBottom();
}

QString ExchangeDock::copyText() const {
    QList<int> rows;
    for (const QModelIndex& selected : view_.selectionModel()->selectedRows())
        rows.append(selected.row());
    std::ranges::sort(rows);
    if (rows.isEmpty())
        for (int row = 0; row < filtered_.rowCount(); ++row)
            rows.append(row);
    QString text;
    for (const int row : rows) {
        QStringList cells;
        for (int column = 0; column < filtered_.columnCount(); ++column)
            cells.append(filtered_.index(row, column).data().toString());
        text += cells.join('\t') + '\n';
    }
    return text;
}

void ExchangeDock::copy() const {
    QGuiApplication::clipboard()->setText(copyText());
}

// The view itself would copy one cell.
bool ExchangeDock::eventFilter(QObject* watched, QEvent* event) {
    if (event->type() == QEvent::KeyPress && static_cast<QKeyEvent*>(event)->matches(QKeySequence::Copy)) {
        copy();
        return true;
    }
    return Dock::eventFilter(watched, event);
}

} // namespace kota::hub
