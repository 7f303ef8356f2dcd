#include "hub/shell/projects.h"

#include <utility>

namespace kota::hub {

void Projects::open(const QString& path, std::shared_ptr<const Network> network) {
    close();
    current_ = ++last_;
    projects_[current_] = {path, std::move(network)};
}

void Projects::close() {
    forgetIfUnused(std::exchange(current_, 0));
}

QString Projects::path() const {
    return isOpen() ? projects_.at(current_).path : QString();
}

std::shared_ptr<const Network> Projects::network(Handle handle) const {
    const auto found = projects_.find(handle);
    return found == projects_.end() ? nullptr : found->second.network;
}

Projects::Handle Projects::join() {
    if (isOpen())
        ++projects_.at(current_).members;
    return current_;
}

void Projects::leave(Handle handle) {
    const auto found = projects_.find(handle);
    if (found == projects_.end())
        return;
    --found->second.members;
    forgetIfUnused(handle);
}

void Projects::forgetIfUnused(Handle handle) {
    const auto found = projects_.find(handle);
    if (found != projects_.end() && handle != current_ && found->second.members <= 0)
        projects_.erase(found);
}

} // namespace kota::hub
