#include "hub/project/json_place.h"

#include <QJsonArray>
#include <QJsonObject>

#include <cmath>
#include <utility>

namespace kota::hub {

namespace {

constexpr qsizetype longestQuote = 40;

QString quoted(const QString& text) {
    const QString shown = text.size() > longestQuote ? text.left(longestQuote) + QChar(0x2026) : text;
    return projectText(ProjectText::QuotedText).arg(shown.simplified());
}

} // namespace

JsonMisfit::JsonMisfit(QString place, QString expected, QString found)
    : place_(std::move(place)), expected_(std::move(expected)), found_(std::move(found)) {}

JsonPlace JsonPlace::operator[](const char* name) const {
    if (!value_.isObject())
        misfit(ProjectText::AnObject);
    return {value_[QLatin1StringView(name)], this, name, 0};
}

JsonPlace JsonPlace::at(qsizetype element) const {
    if (!value_.isArray())
        misfit(ProjectText::AList);
    return {value_[element], this, nullptr, element};
}

qsizetype JsonPlace::size() const {
    if (!value_.isArray())
        misfit(ProjectText::AList);
    return value_.toArray().size();
}

QString JsonPlace::text() const {
    QString text = value_.toString().trimmed();
    if (text.isEmpty())
        misfit(ProjectText::AText);
    return text;
}

double JsonPlace::number() const {
    const double number = value_.toDouble(std::numeric_limits<double>::quiet_NaN());
    if (!std::isfinite(number))
        misfit(ProjectText::ANumber);
    return number;
}

QString JsonPlace::path() const {
    if (!within_)
        return {};
    const QString before = within_->path();
    if (!name_)
        return before + QLatin1Char('[') + QString::number(element_) + QLatin1Char(']');
    return before.isEmpty() ? QLatin1String(name_) : before + QLatin1Char('.') + QLatin1String(name_);
}

void JsonPlace::misfit(ProjectText expected) const {
    throw JsonMisfit(path(), projectText(expected), found());
}

QString JsonPlace::found() const {
    switch (value_.type()) {
    case QJsonValue::Null:
        return QStringLiteral("null");
    case QJsonValue::Bool:
        return value_.toBool() ? QStringLiteral("true") : QStringLiteral("false");
    case QJsonValue::Double:
        return QString::number(value_.toDouble(), 'g', QLocale::FloatingPointShortest);
    case QJsonValue::String:
        return quoted(value_.toString());
    case QJsonValue::Array:
        return projectText(value_.toArray().isEmpty() ? ProjectText::AnEmptyList : ProjectText::SomeList);
    case QJsonValue::Object:
        return projectText(ProjectText::SomeObject);
    case QJsonValue::Undefined:
        break;
    }
    return projectText(ProjectText::Nothing);
}

} // namespace kota::hub
