#include "hub/project/geojson.h"

#include "hub/project/geojson_features.h"
#include "hub/project/json_place.h"
#include "hub/project/projection.h"

#include <QFile>
#include <QFileInfo>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>

#include <algorithm>
#include <utility>

namespace kota::hub {

namespace {

// A place within a wider one; the narrower one may be empty.
QString within(const QString& place, const QString& narrower) {
    return narrower.isEmpty() ? place : projectText(ProjectText::Within).arg(place, narrower);
}

NetworkReading failure(const QString& error) {
    return {.network = nullptr, .error = error};
}

NetworkReading failure(const QString& fileName, const QString& feature, const JsonMisfit& misfit) {
    const QString place = within(within(fileName, feature), misfit.place());
    return failure(projectText(ProjectText::Misfit).arg(place, misfit.expected(), misfit.found()));
}

NetworkReading failure(const QString& fileName, const QByteArray& bytes, const QJsonParseError& error) {
    const QByteArray before = bytes.left(std::clamp<qsizetype>(error.offset, 0, bytes.size()));
    const qsizetype line = before.count('\n') + 1;
    const qsizetype column = QString::fromUtf8(before.mid(before.lastIndexOf('\n') + 1)).size() + 1;
    return failure(projectText(ProjectText::NotJson)
                       .arg(fileName, QString::number(line), QString::number(column), error.errorString()));
}

QJsonValue rootOf(const QJsonDocument& document) {
    return document.isArray() ? QJsonValue(document.array()) : QJsonValue(document.object());
}

} // namespace

NetworkReading readNetwork(const QString& path) {
    QFile file(path);
    const QString fileName = QFileInfo(path).fileName();
    if (!file.open(QIODevice::ReadOnly))
        return failure(projectText(ProjectText::FileNotReadable).arg(fileName, file.errorString()));
    const QByteArray bytes = file.readAll();
    if (file.error() != QFileDevice::NoError)
        return failure(projectText(ProjectText::FileNotReadable).arg(fileName, file.errorString()));
    return networkFromGeoJson(bytes, fileName);
}

NetworkReading networkFromGeoJson(const QByteArray& bytes, const QString& fileName) {
    QJsonParseError error;
    const QJsonDocument document = QJsonDocument::fromJson(bytes, &error);
    if (error.error != QJsonParseError::NoError)
        return failure(fileName, bytes, error);
    const JsonPlace root(rootOf(document));
    GeoJsonFeatures features(root);
    try {
        return {.network = std::make_shared<const Network>(features.read()), .error = {}};
    } catch (const JsonMisfit& misfit) {
        return failure(fileName, features.current(), misfit);
    }
}

} // namespace kota::hub
