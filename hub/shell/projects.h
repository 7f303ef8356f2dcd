#pragma once

#include "hub/project/network.h"

#include <QString>

#include <cstdint>
#include <map>
#include <memory>

namespace kota::hub {

// The project that is open, and those that documents still belong to. A project is known by a handle, as
// editors keep it: never 0, and never given twice.
class Projects {
public:
    using Handle = std::intptr_t;

    // In place of the one that is open.
    void open(const QString& path, std::shared_ptr<const Network> network);
    void close();
    bool isOpen() const { return current_ != 0; }
    Handle current() const { return current_; } // 0 when none is open
    // The network's file; empty when none is open.
    QString path() const;
    // Null when none is open.
    std::shared_ptr<const Network> network() const { return network(current_); }
    // Null for a handle that no project has.
    std::shared_ptr<const Network> network(Handle handle) const;

    // A document joins the open project: its handle, 0 when none is open.
    Handle join();
    void leave(Handle handle);

private:
    struct Project {
        QString path;
        std::shared_ptr<const Network> network;
        int members = 0;
    };
    void forgetIfUnused(Handle handle);

    std::map<Handle, Project> projects_;
    Handle current_ = 0; // 0 for none
    Handle last_ = 0;
};

} // namespace kota::hub
