#pragma once
// The help book: found beside the program, shown in a window of its own.

#include <QPointer>
#include <QString>

class QHelpEngine;

namespace zel {

class HelpWindow;

/// Costs nothing before its first use.
class HelpViewer {
  public:
    /// The book is `programFolder`/help/zelremote.qch. What the viewer notes down about it goes
    /// into `homeFolder`, or, where that cannot be written, into a temporary folder.
    HelpViewer(QString programFolder, QString homeFolder);
    ~HelpViewer();
    HelpViewer(const HelpViewer&) = delete;
    HelpViewer& operator=(const HelpViewer&) = delete;

    /// Path of the book, whether it is there or not.
    QString book() const;
    /// Opens the topic, or the contents for a number that no topic has. False when the book is
    /// missing or damaged.
    bool show(int context);
    HelpWindow* window() const;

  private:
    QString programFolder_;
    QString homeFolder_;
    QPointer<HelpWindow> window_;
};

}  // namespace zel
