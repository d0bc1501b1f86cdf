#pragma once
// Takes members out of a JSON object, and keeps what is wrong with them.

#include <QJsonArray>
#include <QJsonObject>
#include <QString>
#include <functional>
#include <string>
#include <utility>
#include <vector>

namespace zel {

/// An object within a document. All readers of a document share one list of complaints.
class JsonReader {
  public:
    JsonReader(QJsonObject object, QString place, QString& problem)
        : object_(std::move(object)), place_(std::move(place)), problem_(problem) {}

    /// A member that is missing leaves `target` as it is. "inf" and "-inf" are numbers, null is
    /// none.
    void take(const char* name, double& target) const;
    void take(const char* name, int& target) const;
    void take(const char* name, bool& target) const;
    void take(const char* name, std::string& target) const;
    void take(const char* name, std::vector<double>& target) const;
    /// Calls `each` with every object of a list.
    void list(const char* name, const std::function<void(const JsonReader&)>& each) const;
    /// Calls `inner` with the object of that name, where there is one.
    void object(const char* name, const std::function<void(const JsonReader&)>& inner) const;

    void complain(const char* name, const QString& what) const;

  private:
    const QJsonArray arrayOf(const char* name) const;

    QJsonObject object_;
    QString place_;
    QString& problem_;
};

}  // namespace zel
