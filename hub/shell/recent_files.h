#pragma once

#include <QStringList>

namespace kota::hub {

// The files opened or saved last, the latest first, kept in the user's settings.
class RecentFiles {
public:
    static constexpr int most = 8;

    RecentFiles();

    const QStringList& paths() const { return paths_; }
    void add(const QString& path);
    // Of a file that is not there any more.
    void remove(const QString& path);

private:
    void save() const;

    QStringList paths_;
};

} // namespace kota::hub
