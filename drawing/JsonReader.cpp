#include "drawing/JsonReader.h"

#include <cmath>
#include <cstddef>
#include <functional>
#include <limits>
#include <optional>
#include <string>
#include <vector>

namespace zel {
namespace {

/// More than any picture has; a list beyond is a mistake.
constexpr qsizetype kLongestList = 1'000'000;

std::optional<double> numberOf(const QJsonValue& value) {
    if (value.isDouble()) return value.toDouble();
    if (value.isNull()) return std::numeric_limits<double>::quiet_NaN();
    const QString text = value.toString();
    if (text == "inf") return std::numeric_limits<double>::infinity();
    if (text == "-inf") return -std::numeric_limits<double>::infinity();
    return std::nullopt;
}

}  // namespace

void JsonReader::complain(const char* name, const QString& what) const {
    if (problem_.isEmpty()) problem_ = place_ + name + ": " + what;
}

void JsonReader::take(const char* name, double& target) const {
    const QJsonValue value = object_.value(QLatin1String(name));
    if (value.isUndefined()) return;
    const std::optional<double> number = numberOf(value);
    if (!number) return complain(name, "is no number");
    target = *number;
}

void JsonReader::take(const char* name, int& target) const {
    const QJsonValue value = object_.value(QLatin1String(name));
    if (value.isUndefined()) return;
    const double number = value.toDouble(std::numeric_limits<double>::quiet_NaN());
    const bool whole =
        std::floor(number) == number && std::fabs(number) <= std::numeric_limits<int>::max();
    if (!whole) return complain(name, "is no whole number");
    target = static_cast<int>(number);
}

void JsonReader::take(const char* name, bool& target) const {
    const QJsonValue value = object_.value(QLatin1String(name));
    if (value.isUndefined()) return;
    if (!value.isBool()) return complain(name, "is neither true nor false");
    target = value.toBool();
}

void JsonReader::take(const char* name, std::string& target) const {
    const QJsonValue value = object_.value(QLatin1String(name));
    if (value.isUndefined()) return;
    if (!value.isString()) return complain(name, "is no text");
    target = value.toString().toStdString();
}

const QJsonArray JsonReader::arrayOf(const char* name) const {
    const QJsonValue value = object_.value(QLatin1String(name));
    if (value.isUndefined()) return {};
    if (!value.isArray()) {
        complain(name, "is no list");
        return {};
    }
    if (value.toArray().size() > kLongestList) {
        complain(name, "is too long");
        return {};
    }
    return value.toArray();
}

void JsonReader::take(const char* name, std::vector<double>& target) const {
    const QJsonArray array = arrayOf(name);
    target.clear();
    target.reserve(static_cast<std::size_t>(array.size()));
    for (const QJsonValue value : array) {
        const std::optional<double> number = numberOf(value);
        if (!number) return complain(name, "holds what is no number");
        target.push_back(*number);
    }
}

void JsonReader::list(const char* name, const std::function<void(const JsonReader&)>& each) const {
    int index = 0;
    for (const QJsonValue value : arrayOf(name)) {
        if (!value.isObject()) return complain(name, "holds what is no object");
        each(JsonReader(value.toObject(), place_ + name + QString("[%1].").arg(index++), problem_));
        if (!problem_.isEmpty()) return;
    }
}

void JsonReader::object(const char* name,
                        const std::function<void(const JsonReader&)>& inner) const {
    const QJsonValue value = object_.value(QLatin1String(name));
    if (value.isUndefined()) return;
    if (!value.isObject()) return complain(name, "is no object");
    inner(JsonReader(value.toObject(), place_ + name + ".", problem_));
}

}  // namespace zel
