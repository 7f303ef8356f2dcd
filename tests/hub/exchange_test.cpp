#include "hub/shell/exchange.h"
#include "hub/shell/exchange_model.h"
#include "platform/framework/window.h"

#include <gmock/gmock.h>

namespace {

using namespace kota::hub;
using testing::ElementsAre;

std::shared_ptr<const Network> networkOf(const QStringList& names) {
    std::vector<River> rivers;
    for (const QString& name : names)
        rivers.push_back({name, {{0, 0}, {1000, 0}}, {0, 1000}});
    return std::make_shared<const Network>(std::move(rivers));
}

class TheExchange : public testing::Test {
protected:
    TheExchange() {
        exchange.onMessage = [this](const PassedMessage& message) { passed.push_back(message); };
    }

    LRESULT ask(WPARAM code, Projects::Handle project = 0) {
        CKHComm_Package package;
        package.documentName = "river.AD31";
        package.project = project;
        return exchange.take(switchBoardMessage(), code, &package);
    }
    std::vector<std::string> askRivers(Projects::Handle project) {
        std::unique_ptr<CObList> rivers(
            reinterpret_cast<CObList*>(ask(SwitchBoardCode::OfferRivers, project)));
        std::vector<std::string> names;
        while (rivers && !rivers->IsEmpty()) {
            const std::unique_ptr<CK31_CBE_ModelDataItem> item(
                static_cast<CK31_CBE_ModelDataItem*>(rivers->RemoveHead()));
            names.emplace_back(item->riverName.View());
        }
        return names;
    }
    std::unique_ptr<CK31_CBE_ModelDataItem> askLocation() {
        return std::unique_ptr<CK31_CBE_ModelDataItem>(
            reinterpret_cast<CK31_CBE_ModelDataItem*>(ask(SwitchBoardCode::OfferLocation)));
    }
    void tellLocation(const char* river, double chainage, int dataType) {
        CK31_CBE_ModelDataItem item;
        item.riverName = river;
        item.chainage = chainage;
        item.dataType = dataType;
        CKHComm_Package package;
        package.documentName = "river.AD31";
        package.items = &item;
        exchange.take(communicationMessage(), CommunicationCode::LocationChanged, &package);
    }

    Projects projects;
    Exchange exchange{projects};
    std::vector<PassedMessage> passed;
};

TEST_F(TheExchange, HasNoProjectToJoinAtFirst) {
    EXPECT_EQ(ask(SwitchBoardCode::JoinProject), 0);
    EXPECT_EQ(ask(SwitchBoardCode::OfferRivers), 0);
    EXPECT_EQ(askLocation(), nullptr);
}

TEST_F(TheExchange, GivesTheHandleOfTheOpenProject) {
    projects.open("one.geojson", networkOf({"A"}));
    const LRESULT first = ask(SwitchBoardCode::JoinProject);
    EXPECT_NE(first, 0);
    EXPECT_EQ(ask(SwitchBoardCode::JoinProject), first);

    projects.open("two.geojson", networkOf({"B"}));
    EXPECT_NE(ask(SwitchBoardCode::JoinProject), first);
}

TEST_F(TheExchange, GivesTheRiversOfTheProjectThatIsAskedFor) {
    projects.open("one.geojson", networkOf({"MISSOURI", "PLATTE", "MISSOURI"}));
    const Projects::Handle one = ask(SwitchBoardCode::JoinProject);
    projects.open("two.geojson", networkOf({"Å"}));
    const Projects::Handle two = ask(SwitchBoardCode::JoinProject);

    EXPECT_THAT(askRivers(one), ElementsAre("MISSOURI", "PLATTE")) << "a document still belongs to it";
    EXPECT_THAT(askRivers(two), ElementsAre("Å"));
    EXPECT_THAT(askRivers(0), testing::IsEmpty());
    EXPECT_THAT(askRivers(99), testing::IsEmpty());
}

TEST_F(TheExchange, ForgetsAClosedProjectWhenTheLastWindowLeavesIt) {
    projects.open("one.geojson", networkOf({"A"}));
    const Projects::Handle handle = ask(SwitchBoardCode::JoinProject);
    ask(SwitchBoardCode::JoinProject);
    projects.close();
    ask(SwitchBoardCode::LeaveProject, handle);
    EXPECT_NE(projects.network(handle), nullptr);

    ask(SwitchBoardCode::LeaveProject, handle);

    EXPECT_EQ(projects.network(handle), nullptr);
    ask(SwitchBoardCode::LeaveProject, handle);
    EXPECT_EQ(ask(SwitchBoardCode::JoinProject), 0);
}

TEST_F(TheExchange, KeepsTheOpenProjectWithoutMembers) {
    projects.open("one.geojson", networkOf({"A"}));
    const Projects::Handle handle = ask(SwitchBoardCode::JoinProject);

    ask(SwitchBoardCode::LeaveProject, handle);

    EXPECT_NE(projects.network(), nullptr);
    EXPECT_EQ(projects.path(), "one.geojson");
}

TEST_F(TheExchange, OffersWhatWasPickedInBothChainages) {
    exchange.offer(Place{"PLATTE", 12.5});

    const auto item = askLocation();

    ASSERT_NE(item, nullptr);
    EXPECT_EQ(item->riverName, "PLATTE");
    EXPECT_EQ(item->chainage, 12.5);
    EXPECT_EQ(item->chainage2, 12.5);
    ASSERT_EQ(passed.size(), 1U);
    EXPECT_EQ(passed[0].place, (Place{"PLATTE", 12.5}));
    exchange.offer({});
    EXPECT_EQ(askLocation(), nullptr);
}

TEST_F(TheExchange, KeepsWhereTheUserIs) {
    int changes = 0;
    exchange.onCurrentPlace = [&] { ++changes; };

    tellLocation("MISSOURI", 1000, 4);
    EXPECT_EQ(exchange.current(), (Place{"MISSOURI", 1000}));
    tellLocation("MISSOURI", 1000, 5);
    EXPECT_EQ(changes, 1) << "the place is the same";
    exchange.take(communicationMessage(), CommunicationCode::LocationChanged, nullptr);

    EXPECT_EQ(exchange.current(), std::nullopt);
    EXPECT_EQ(changes, 2);
}

TEST_F(TheExchange, TakesAPackageWithoutAnItemForNoPlace) {
    tellLocation("MISSOURI", 1000, 4);
    CKHComm_Package package;
    exchange.take(communicationMessage(), CommunicationCode::LocationChanged, &package);
    EXPECT_EQ(exchange.current(), std::nullopt);
}

TEST_F(TheExchange, AnswersNothingToCodesItDoesNotKnow) {
    for (const WPARAM code : {0U, 1U, 42U, 999U}) {
        EXPECT_EQ(exchange.take(switchBoardMessage(), code, nullptr), 0);
        EXPECT_EQ(exchange.take(communicationMessage(), code, nullptr), 0);
    }
    EXPECT_EQ(passed.size(), 8U);
}

// The lines of the list of messages.
class TheMessages : public TheExchange {
protected:
    TheMessages() {
        exchange.onMessage = [this](const PassedMessage& message) { model.add(message, time); };
    }

    std::vector<std::string> line(int row) const {
        std::vector<std::string> cells;
        for (int column = 0; column < model.columnCount(); ++column)
            cells.push_back(model.index(row, column).data().toString().toStdString());
        return cells;
    }

    ExchangeModel model;
    QDateTime time{QDate(2026, 1, 2), QTime(3, 4, 5, 6)};
};

TEST_F(TheMessages, TellEachWithItsMeaningSenderAndPlace) {
    ask(SwitchBoardCode::JoinProject);
    tellLocation("MISSOURI", 1000.5, 5);
    exchange.offer(Place{"PLATTE", 2});
    askLocation();
    exchange.take(communicationMessage(), CommunicationCode::DataChanged, nullptr);
    exchange.take(showToolbarMessage(), toolbarCommand, nullptr);
    exchange.take(switchBoardMessage(), 77, nullptr);

    EXPECT_THAT(line(0), ElementsAre("03:04:05.006", "25", "asks for the project", "river.AD31", "", "", ""));
    EXPECT_THAT(line(1), ElementsAre("03:04:05.006", "503", "location changed", "river.AD31", "MISSOURI",
                                     "1000.500", "5 Dispersion"));
    EXPECT_THAT(line(2), ElementsAre("03:04:05.006", "200", "asks for a location", "river.AD31", "PLATTE",
                                     "2.000", ""));
    EXPECT_THAT(line(3), ElementsAre("03:04:05.006", "523", "data changed", "", "", "", ""));
    EXPECT_THAT(line(4), ElementsAre("03:04:05.006", "42550", "shows its tool bar", "", "", "", ""));
    EXPECT_THAT(line(5), ElementsAre("03:04:05.006", "77", "unknown", "", "", "", ""));
}

TEST_F(TheMessages, TellOfADataTypeThatNobodyKnowsByItsNumber) {
    for (const int type : {-1, 7, 8})
        tellLocation("A", 0, type);
    EXPECT_EQ(line(0).back(), "-1");
    EXPECT_EQ(line(1).back(), "7 Boundary");
    EXPECT_EQ(line(2).back(), "8");
}

TEST_F(TheMessages, AreForgottenFromTheOldestOn) {
    for (int i = 0; i <= ExchangeModel::most; ++i)
        exchange.take(switchBoardMessage(), static_cast<WPARAM>(i), nullptr);

    EXPECT_EQ(model.rowCount(), ExchangeModel::most);
    EXPECT_EQ(line(0)[1], "1");
    EXPECT_EQ(line(ExchangeModel::most - 1)[1], std::to_string(ExchangeModel::most));
    model.clear();
    EXPECT_EQ(model.rowCount(), 0);
}

} // namespace
