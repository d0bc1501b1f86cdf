#pragma once
// Binds the controls of the forms to widgets: what a control changes is shown with the next frame,
// what a user does goes to the control at once.

#include <QAbstractButton>
#include <QAction>
#include <QCheckBox>
#include <QComboBox>
#include <QGroupBox>
#include <QLabel>
#include <QLineEdit>
#include <QObject>
#include <QPointer>
#include <QPushButton>
#include <QRadioButton>
#include <QSlider>
#include <QTimer>
#include <functional>
#include <optional>
#include <string>
#include <unordered_map>
#include <unordered_set>
#include <utility>

#include "desktop/platform/KeyCodes.h"
#include "platform/Controls.h"
#include "platform/Form.h"

namespace zel {

/// What changes is drawn once in this time, however often it changes.
inline constexpr int kFrameMs = 25;

class PanelLineEdit;

class Binder : public QObject {
  public:
    explicit Binder(QObject* parent = nullptr);

    void bind(Button& control, QPushButton* widget);
    void bind(TextBox& control, PanelLineEdit* widget);
    void bind(Label& control, QLabel* widget);
    void bind(CheckBox& control, QCheckBox* widget);
    void bind(OptionButton& control, QRadioButton* widget);
    void bind(DropDownList& control, QComboBox* widget);
    void bind(Slider& control, QSlider* widget);
    void bind(Frame& control, QWidget* widget, QLabel* caption);
    void bind(MenuItem& control, QAction* action);
    /// A second way to a control that has its widget: the action clicks the same control. `show`
    /// runs after the action has taken over whether it can be used.
    void twin(Button& control, QAction* action, std::function<void()> show = {});
    void twin(MenuItem& control, QAction* action, std::function<void()> show = {});
    /// For controls that need a drawing of their own: `show` runs with the next frame after a
    /// change.
    void bindShow(Control& control, QWidget* widget, std::function<void()> show);
    void bindForm(Form& form, QObject* owner, std::function<void()> show);

    /// Shows the form again with the next frame.
    void refresh(const Form& form) { markDirty(&form); }
    void refresh(const Control& control) { markDirty(&control); }
    /// Keeps a control from being used, with the reason; an empty one ends that.
    void block(const Control& control, const std::string& reason);
    /// Shows every control and form again: the colours have changed.
    void refreshAll();
    /// Shows all changes now.
    void flush();
    /// While this answers true for a control, what a user does to it is dropped: work is under
    /// way that it must not disturb.
    std::function<bool(const Control&)> refuses;
    /// Whether what a user does to a control waits for the end of what is under way.
    std::function<bool(const Control&)> defers;
    /// Why a control would only show a box that refuses; empty while it works. Its widget is grey
    /// meanwhile and has the reason in its tool tip.
    std::function<std::string(const Control&)> reasonAgainst;
    /// Runs what a user does to a control, now or in its turn; at once where it is empty.
    std::function<void(const Control&, std::function<void()>)> perform;
    /// Reports the exception that is being handled; without it the exception goes on.
    std::function<void()> failed;
    /// Hears what the user does: "click NAME", "choose NAME INDEX", "type NAME TEXT", "set NAME
    /// TEXT", "key NAME KEY", in two parts.
    std::function<void(const std::string& act, const std::string& what)> tell;
    /// Whether the control was bound, for the tests.
    QObject* widgetOf(const Control& control) const;

  private:
    void follow(Control& control, QObject* widget, std::function<void()> show);
    void markDirty(const void* key);
    QString reasonFor(const Control& control) const;
    bool usable(const Control& control) const { return reasonFor(control).isEmpty(); }
    template <class T>
    void addTwin(T& control, QAction* action, std::function<void()> show);
    void describe(const Control& control, QWidget* widget);
    bool refused(const Control& control) const;
    void act(const Control& control, std::function<void()> work) const;
    void note(const Control& control, const char* act, const std::string& rest = {}) const;

    struct Entry {
        QObject* widget = nullptr;
        std::function<void()> show;
    };
    std::unordered_map<const void*, Entry> entries_;
    std::unordered_set<const void*> dirty_;
    std::unordered_map<const Control*, std::string> blocked_;
    QTimer frame_;
    bool flushing_ = false;
};

/// A line of text that gives its text box each key before the insertion.
class PanelLineEdit : public QLineEdit {
  public:
    explicit PanelLineEdit(QWidget* parent = nullptr);
    /// What a user does to the text: "type" with a character, "key" with the name of a key, "set"
    /// with the whole text.
    using Tell = std::function<void(const char* act, const std::string& what)>;
    /// `enter` may take an Enter over that has to wait for its turn.
    void setControl(TextBox* control, std::function<bool()> refused,
                    std::function<bool(std::function<void()>)> enter, Tell tell);
    /// Looks at an entry before Enter sends it: changes the text into what the panel reads, or
    /// says false with the problem, and nothing is sent.
    void setReader(std::function<bool(QString& text, QString& problem)> reader) {
        reader_ = std::move(reader);
    }
    /// Marks the text as one that cannot be read, until it changes; an empty problem ends that.
    void showProblem(const QString& problem);
    /// A key is on its way into the text, and its control knows of it.
    bool typing() const { return typing_; }
    /// Puts the edited text into the control. The keys alone do not say what becomes of a text of
    /// which a part was selected; then the text is reported as well.
    void takeOver(const std::string& edited);

  protected:
    void keyPressEvent(QKeyEvent* event) override;

  private:
    void insertKey(QKeyEvent* event);
    void tellKey(int code, int character);
    bool readable();

    TextBox* control_ = nullptr;
    bool typing_ = false;
    std::optional<std::string> typed_;  ///< the text that the keys alone would give
    Tell tell_;
    std::function<bool()> refused_;
    std::function<bool(std::function<void()>)> enter_;
    std::function<bool(QString& text, QString& problem)> reader_;
    QString ownTip_;
    bool marked_ = false;
};

/// The face of a control's colour for the style sheet: "plain", "red", "green", "gray".
QString faceOf(Color color);
/// A property that the style sheet asks for; the widget is drawn again when it changes.
void setMark(QWidget* widget, const char* name, bool on);
/// Puts the face on the widget and has it drawn again.
void setFace(QWidget* widget, const QString& face);

}  // namespace zel
