#pragma once

#include "hub/project/project_texts.h"

#include <QJsonValue>

#include <exception>

namespace kota::hub {

// What does not fit in a JSON file, in the user's words.
class JsonMisfit : public std::exception {
public:
    JsonMisfit(QString place, QString expected, QString found);

    const char* what() const noexcept override { return "a value that does not fit"; }

    const QString& place() const { return place_; }
    const QString& expected() const { return expected_; }
    const QString& found() const { return found_; }

private:
    QString place_;
    QString expected_;
    QString found_;
};

// A value of a JSON document that knows where it stands. What is asked of a value that does not fit throws a
// JsonMisfit. A place lives no longer than the one that it was got from.
class JsonPlace {
public:
    explicit JsonPlace(QJsonValue value) : value_(std::move(value)) {}

    // Of an object; a member that is not there is an undefined value.
    JsonPlace operator[](const char* name) const;
    // Of a list, from 0 to below its size.
    JsonPlace at(qsizetype element) const;
    qsizetype size() const;

    // The same value as a root, from which paths count.
    JsonPlace asRoot() const { return JsonPlace(value_); }

    bool isThere() const { return !value_.isUndefined(); }
    bool isNull() const { return value_.isNull(); }
    // With other characters than spaces.
    QString text() const;
    // Finite.
    double number() const;

    // As in `a.b[2]`, elements counted from 0, from the root, which itself has an empty path.
    QString path() const;
    [[noreturn]] void misfit(ProjectText expected) const;

private:
    JsonPlace(QJsonValue value, const JsonPlace* within, const char* name, qsizetype element)
        : value_(std::move(value)), within_(within), name_(name), element_(element) {}

    QString found() const;

    QJsonValue value_;
    const JsonPlace* within_ = nullptr; // null at the root
    const char* name_ = nullptr;        // null at the root and in a list
    qsizetype element_ = 0;
};

} // namespace kota::hub
