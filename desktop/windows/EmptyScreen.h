#pragma once
// What stands on the graph while there is nothing to show: the ways to begin.

#include <QPushButton>
#include <QWidget>
#include <functional>
#include <vector>

class QVBoxLayout;

namespace zel {

class EmptyScreen : public QWidget {
  public:
    struct Ways {
        std::function<void()> connect;
        std::function<void(int)> connectAgain;  ///< by the place in the list
        std::function<void()> simulate;
        std::function<void()> open;
        std::function<void()> again;  ///< the last attempt once more
    };
    EmptyScreen(Ways ways, QWidget* parent);

    /// The last connections, as they are called.
    void setRecent(const QStringList& names);

  private:
    QPushButton* addWay(const QString& text, const char* icon, std::function<void()> act);

    Ways ways_;
    QVBoxLayout* layout_;
    std::vector<QPushButton*> recent_;
};

}  // namespace zel
