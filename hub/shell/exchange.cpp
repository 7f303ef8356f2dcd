#include "hub/shell/exchange.h"

#include "hub/screen/text.h"

#include <memory>

namespace kota::hub {

namespace {

std::unique_ptr<CK31_CBE_ModelDataItem> itemAt(const Place& place) {
    auto item = std::make_unique<CK31_CBE_ModelDataItem>();
    item->riverName = toPlatform(place.river).constData();
    item->chainage = place.chainage;
    item->chainage2 = place.chainage;
    return item;
}

std::unique_ptr<CObList> riversOf(const Network& network) {
    auto rivers = std::make_unique<CObList>();
    for (const QString& name : network.names())
        rivers->AddTail(itemAt({name, 0}).release());
    return rivers;
}

LRESULT handOver(std::unique_ptr<CObject> object) {
    return reinterpret_cast<LRESULT>(object.release());
}

} // namespace

bool Exchange::isMessage(UINT message) {
    return message == switchBoardMessage() || message == communicationMessage() ||
           message == showToolbarMessage() || message == hideToolbarMessage();
}

LRESULT Exchange::take(UINT message, WPARAM code, const CKHComm_Package* package) {
    PassedMessage passed{message, code, package ? toQt(package->documentName) : QString(), {}, {}};
    LRESULT result = 0;
    if (message == switchBoardMessage())
        result = answer(code, package, passed);
    else if (message == communicationMessage() && code == CommunicationCode::LocationChanged)
        takeLocation(package, passed);
    if (onMessage)
        onMessage(passed);
    return result;
}

LRESULT Exchange::answer(WPARAM code, const CKHComm_Package* package, PassedMessage& passed) {
    const Projects::Handle handle = package ? package->project : 0;
    switch (code) {
    case SwitchBoardCode::JoinProject:
        return projects_.join();
    case SwitchBoardCode::LeaveProject:
        projects_.leave(handle);
        return 0;
    case SwitchBoardCode::OfferRivers: {
        const auto network = projects_.network(handle);
        return network ? handOver(riversOf(*network)) : 0;
    }
    case SwitchBoardCode::OfferLocation: {
        if (!offered_)
            return 0;
        passed.place = offered_;
        auto item = itemAt(*offered_);
        passed.dataType = item->dataType;
        return handOver(std::move(item));
    }
    default:
        return 0;
    }
}

void Exchange::takeLocation(const CKHComm_Package* package, PassedMessage& passed) {
    const auto* const item = package ? dynamic_cast<const CK31_CBE_ModelDataItem*>(package->items) : nullptr;
    std::optional<Place> told;
    if (item) {
        told = Place{toQt(item->riverName), item->chainage};
        passed.dataType = item->dataType;
    }
    passed.place = told;
    if (told == current_)
        return;
    current_ = std::move(told);
    if (onCurrentPlace)
        onCurrentPlace();
}

} // namespace kota::hub
