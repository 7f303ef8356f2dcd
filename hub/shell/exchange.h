#pragma once

#include "exchange/packages/packages.h"
#include "hub/shell/projects.h"

#include <functional>
#include <map>
#include <optional>

class CDocument;

namespace kota::hub {

// A place of a river.
struct Place {
    QString river;
    double chainage = 0; // m

    friend bool operator==(const Place&, const Place&) = default;
};

// One message between an editor and the shell, as somebody who builds an editor wants to see it.
struct PassedMessage {
    UINT message = 0; // as registered
    WPARAM code = 0;
    QString sender;             // the document's title; empty where the package does not say
    std::optional<Place> place; // that was told or offered
    std::optional<int> dataType;
};

// The shell's side of the exchange with editors: answers what they ask from the open project, and keeps what
// they tell.
class Exchange {
public:
    // The projects must outlive it.
    explicit Exchange(Projects& projects) : projects_(projects) {}

    // Whether a registered message is one of the exchange.
    static bool isMessage(UINT message);
    // Takes a message of an editor; the package may be null. The result is the answer, which the editor owns.
    LRESULT take(UINT message, WPARAM code, const CKHComm_Package* package);

    // The place that is offered to an editor which asks for one.
    void offer(std::optional<Place> place) { offered_ = std::move(place); }
    const std::optional<Place>& offered() const { return offered_; }
    // The last place that an editor told; none when none has, or the window that told has gone.
    const std::optional<Place>& current() const { return current_; }

    // Called behind each message, and when the current place has become another.
    std::function<void(const PassedMessage&)> onMessage;
    std::function<void()> onCurrentPlace;

private:
    // A document of which several windows ask belongs to one project, whichever is open meanwhile.
    struct Membership {
        Projects::Handle project = 0;
        int windows = 0;
    };
    Projects::Handle join(const CView* window);
    void leave(const CView* window, Projects::Handle project);
    LRESULT answer(WPARAM code, const CKHComm_Package& package, PassedMessage& passed);
    void takeLocation(const CKHComm_Package* package, PassedMessage& passed);

    Projects& projects_;
    std::map<const CDocument*, Membership> members_; // of documents that belong to a project
    HWND teller_ = nullptr;                          // the window that told the current place
    std::optional<Place> offered_;
    std::optional<Place> current_;
};

} // namespace kota::hub
