#include "hub/shell/exchange.h"

#include "hub/screen/text.h"
#include "platform/framework/document.h"
#include "platform/framework/view.h"

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
    static const CKHComm_Package empty;
    LRESULT result = 0;
    if (message == switchBoardMessage())
        result = answer(code, package ? *package : empty, passed);
    else if (message == communicationMessage() && code == CommunicationCode::LocationChanged)
        takeLocation(package, passed);
    if (onMessage)
        onMessage(passed);
    return result;
}

Projects::Handle Exchange::join(const CView* window) {
    const CDocument* const document = window ? window->GetDocument() : nullptr;
    if (!document)
        return projects_.join();
    if (document->Views().size() <= 1) { // its first window
        members_.erase(document);        // of another document that was there before
        const Projects::Handle project = projects_.join();
        if (project != 0)
            members_[document] = {project, 1};
        return project;
    }
    const auto member = members_.find(document);
    if (member == members_.end())
        return 0;
    ++member->second.windows;
    return member->second.project;
}

void Exchange::leave(const CView* window, Projects::Handle project) {
    const auto member = members_.find(window ? window->GetDocument() : nullptr);
    if (member != members_.end() && --member->second.windows > 0)
        return;
    if (member != members_.end())
        members_.erase(member);
    projects_.leave(project);
}

LRESULT Exchange::answer(WPARAM code, const CKHComm_Package& package, PassedMessage& passed) {
    switch (code) {
    case SwitchBoardCode::JoinProject:
        return join(package.sender);
    case SwitchBoardCode::LeaveProject:
        leave(package.sender, package.project);
        return 0;
    case SwitchBoardCode::OfferRivers: {
        const auto network = projects_.network(package.project);
        return network ? handOver(riversOf(*network)) : 0;
    }
    case SwitchBoardCode::OfferLocation:
        // A place of the open project is nowhere in another one.
        if (!offered_ || (package.project != 0 && package.project != projects_.current()))
            return 0;
        passed.place = offered_;
        return handOver(itemAt(*offered_));
    default:
        return 0;
    }
}

void Exchange::takeLocation(const CKHComm_Package* package, PassedMessage& passed) {
    const auto* const item = package ? dynamic_cast<const CK31_CBE_ModelDataItem*>(package->items) : nullptr;
    if (!package && IsWindow(teller_)) // another window went
        return;
    std::optional<Place> told;
    if (item) {
        told = Place{toQt(item->riverName), item->chainage};
        passed.dataType = item->dataType;
    }
    teller_ = item && package->sender ? package->sender->GetSafeHwnd() : nullptr;
    passed.place = told;
    if (told == current_)
        return;
    current_ = std::move(told);
    if (onCurrentPlace)
        onCurrentPlace();
}

} // namespace kota::hub
