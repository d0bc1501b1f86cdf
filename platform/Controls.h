#pragma once
// The standard controls of a form, as plain data with their events.

#include <array>
#include <cstddef>
#include <string>
#include <utility>
#include <vector>

#include "platform/Event.h"
#include "platform/Form.h"
#include "platform/Property.h"

namespace zel {

/// Key codes that handlers of text boxes see.
enum KeyCode : int {
    kKeyBackspace = 8,
    kKeyClear = 12,
    kKeyEnter = 13,
    kKeyLeft = 37,
    kKeyRight = 39,
    kKeyF1 = 112,
};

class Button : public Control {
  public:
    Button(Form& form, std::string name, std::string caption = "")
        : Control(form, std::move(name), ControlKind::Button), Caption{this, std::move(caption)} {}
    Property<std::string> Caption;
    /// Key of a picture in the image list; empty shows the caption.
    Property<std::string> Picture{this, ""};
    Event<> Clicked;
    Event<int, int> KeyDown;  ///< key code, shift
    void Click() { Clicked(); }
};

class TextBox : public Control {
  public:
    TextBox(Form& form, std::string name, std::string text = "")
        : Control(form, std::move(name), ControlKind::TextBox), Text{this, std::move(text)} {
        BackColor = kWindowBackground;
    }
    Property<std::string> Text;
    Property<bool> Locked{this, false};
    /// The typed character as a code point; a handler that sets it to 0 swallows it. The
    /// character goes into the text after the handlers.
    Event<int&> KeyPress;
    Event<int, int> KeyDown;  ///< key code, shift; before KeyPress
};

class Label : public Control {
  public:
    Label(Form& form, std::string name, std::string caption = "")
        : Control(form, std::move(name), ControlKind::Label), Caption{this, std::move(caption)} {}
    Property<std::string> Caption;
    Property<bool> Struck{this, false};  ///< the value is unsure: a line goes through it
};

class Frame : public Control {
  public:
    Frame(Form& form, std::string name, std::string caption = "")
        : Control(form, std::move(name), ControlKind::Frame), Caption{this, std::move(caption)} {}
    Property<std::string> Caption;
};

class Picture : public Control {
  public:
    Picture(Form& form, std::string name, std::string image = "")
        : Control(form, std::move(name), ControlKind::Picture), Image{this, std::move(image)} {}
    Property<std::string> Image;
};

/// A box or option that code writes runs its click handler when the value changes, and only then.
class CheckBox : public Control {
  public:
    CheckBox(Form& form, std::string name, std::string caption = "")
        : Control(form, std::move(name), ControlKind::CheckBox),
          Caption{this, std::move(caption)} {}
    Property<std::string> Caption;
    bool Value() const { return value_; }
    void setValue(bool value);
    /// What a user's click does.
    void Click() { setValue(!value_); }
    Event<> Clicked;

  private:
    bool value_ = false;
};

/// One of an exclusive group: the options of one form that bear the same group name. Selecting
/// one deselects the others without running their handlers.
class OptionButton : public Control {
  public:
    OptionButton(Form& form, std::string name, std::string group, std::string caption = "")
        : Control(form, std::move(name), ControlKind::OptionButton),
          Caption{this, std::move(caption)},
          group_(std::move(group)) {}
    Property<std::string> Caption;
    const std::string& group() const { return group_; }
    bool Value() const { return value_; }
    void setValue(bool value);
    void Click() { setValue(true); }
    Event<> Clicked;

  private:
    std::string group_;
    bool value_ = false;
};

/// A drop-down list. Code that writes `Text` or `ListIndex` moves both and fires nothing; `pick`
/// is a user's choice. An editable list takes typed texts that it does not hold.
class DropDownList : public Control {
  public:
    DropDownList(Form& form, std::string name, bool editable = false)
        : Control(form, std::move(name), ControlKind::DropDownList), editable_(editable) {
        BackColor = kWindowBackground;
    }
    bool editable() const { return editable_; }

    const std::string& Text() const { return text_; }
    void setText(const std::string& text);
    int ListIndex() const { return index_; }
    /// An index outside the list selects nothing and empties the text.
    void setListIndex(int index);
    int ListCount() const { return static_cast<int>(items_.size()); }
    /// The entry, or the empty text outside the list.
    const std::string& List(int index) const;
    const std::vector<std::string>& items() const { return items_; }
    void AddItem(std::string item);
    void Clear();
    void setItems(std::vector<std::string> items);

    Property<bool> Locked{this, false};
    /// A user picks the entry: selection, then the click event.
    void pick(int index);
    Event<> Clicked;

  private:
    bool editable_;
    std::vector<std::string> items_;
    std::string text_;
    int index_ = -1;
};

class ListBox : public Control {
  public:
    ListBox(Form& form, std::string name) : Control(form, std::move(name), ControlKind::ListBox) {
        BackColor = kWindowBackground;
    }
    Property<std::vector<std::string>> Items{this, {}};
    Property<int> ListIndex{this, -1};
    Event<> Clicked;
    Event<> DoubleClicked;
};

class Slider : public Control {
  public:
    Slider(Form& form, std::string name) : Control(form, std::move(name), ControlKind::Slider) {}
    Property<int> Min{this, 0};
    Property<int> Max{this, 10};
    Property<int> Value{this, 0};
    Event<> Scrolled;
};

/// A stretch of text of one look.
struct TextRun {
    std::string text;
    bool bold = false;
    bool italic = false;
    Color color = 0;
    bool operator==(const TextRun&) const = default;
};

/// A text in runs of one look each.
class RichText : public Control {
  public:
    RichText(Form& form, std::string name) : Control(form, std::move(name), ControlKind::RichText) {
        BackColor = kWindowBackground;
    }
    const std::vector<TextRun>& runs() const { return runs_; }
    /// The runs without their looks.
    std::string Text() const {
        std::string text;
        for (const TextRun& run : runs_) text += run.text;
        return text;
    }
    bool empty() const { return runs_.empty(); }
    /// At the end; a run of the same look as the last one is joined to it.
    void append(TextRun run);
    void setRuns(std::vector<TextRun> runs);
    void Clear() { setRuns({}); }

  private:
    std::vector<TextRun> runs_;
};

/// A menu (with no click of its own) or an entry of one. `parent` is null for the menus of the
/// menu bar; the caption "-" is a separator.
class MenuItem : public Control {
  public:
    MenuItem(Form& form, std::string name, std::string caption, MenuItem* parent = nullptr)
        : Control(form, std::move(name), ControlKind::MenuItem),
          Caption{this, std::move(caption)},
          parent_(parent) {}
    Property<std::string> Caption;
    Property<bool> Checked{this, false};
    MenuItem* parent() const { return parent_; }
    Event<> Clicked;
    void Click() { Clicked(); }

  private:
    MenuItem* parent_;
};

/// Ticks every `Interval` milliseconds while `Enabled`; an interval of 0 never ticks. It is not
/// enabled at first.
class Timer : public Control {
  public:
    Timer(Form& form, std::string name, int interval)
        : Control(form, std::move(name), ControlKind::Timer), Interval{this, interval} {
        Enabled = false;
        Visible = false;
    }
    Property<int> Interval;
    Event<> Tick;
};

/// Controls of one name with an index: NAME(0) to NAME(N - 1).
template <class T, std::size_t N>
class ControlArray {
  public:
    template <class... Args>
    ControlArray(Form& form, const std::string& name, const Args&... args)
        : items_(make(form, name, std::make_index_sequence<N>{}, args...)) {}

    T& operator()(int index) { return items_.at(static_cast<std::size_t>(index)); }
    const T& operator()(int index) const { return items_.at(static_cast<std::size_t>(index)); }
    static constexpr int count() { return static_cast<int>(N); }
    auto begin() { return items_.begin(); }
    auto end() { return items_.end(); }

  private:
    template <std::size_t... I, class... Args>
    static std::array<T, N> make(Form& form, const std::string& name, std::index_sequence<I...>,
                                 const Args&... args) {
        return {{T(form, name + "(" + std::to_string(I) + ")", args...)...}};
    }
    std::array<T, N> items_;
};

}  // namespace zel
