#pragma once
// A group of keys under a heading that folds it away.

#include <QHBoxLayout>
#include <QToolButton>
#include <QWidget>

namespace zel {

class FoldGroup : public QWidget {
    Q_OBJECT

  public:
    /// Until the user folds or opens it, the group goes by the room.
    enum class Choice { ByRoom, Open, Shut };

    /// `name` is for the settings and never on the screen.
    FoldGroup(const QString& name, const QString& caption, QWidget* content);

    const QString& name() const { return name_; }
    QToolButton& heading() { return *heading_; }
    Choice choice() const { return choice_; }
    void setChoice(Choice choice);
    void setOpen(bool open);
    bool isOpen() const { return heading_->isChecked(); }
    /// Height of the content when it is open, pixels.
    int contentHeight() const;
    /// A row beside the heading, which never folds.
    QHBoxLayout& headingRow() { return *row_; }

    /// The group that a widget is folded away with, or null.
    static FoldGroup* around(const QWidget& widget);
    /// Whether a widget can be seen, or could with its group open.
    static bool offers(const QWidget& widget);
    /// Opens the group of a widget.
    static void reveal(const QWidget& widget);

  signals:
    /// The user has folded or opened it.
    void chosen();

  private:
    QString name_;
    QToolButton* heading_;
    QWidget* content_;
    QHBoxLayout* row_;
    Choice choice_ = Choice::ByRoom;
};

}  // namespace zel
