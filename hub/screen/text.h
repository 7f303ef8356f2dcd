#pragma once

#include "platform/framework/text.h"

#include <QByteArray>
#include <QString>

namespace kota::hub {

// The platform's texts are UTF-8; bytes that are not show as replacement characters.
inline QString toQt(const CString& text) {
    return QString::fromUtf8(text.View().data(), static_cast<qsizetype>(text.View().size()));
}

inline QByteArray toPlatform(const QString& text) {
    return text.toUtf8();
}

} // namespace kota::hub
