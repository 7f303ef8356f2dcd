#pragma once

#include "platform/framework/text.h"

#include <QByteArray>
#include <QString>

#include <string_view>

namespace kota::hub {

// The platform's texts are UTF-8; bytes that are not show as replacement characters.
inline QString toQt(std::string_view text) {
    return QString::fromUtf8(text.data(), static_cast<qsizetype>(text.size()));
}
inline QString toQt(const CString& text) {
    return toQt(text.View());
}

inline QByteArray toPlatform(const QString& text) {
    return text.toUtf8();
}

} // namespace kota::hub
