#pragma once
// The base of every form and of every control on one: named plain data that a front end shows.

#include <cstdint>
#include <string>
#include <string_view>
#include <utility>
#include <variant>
#include <vector>

#include "platform/Event.h"
#include "platform/Property.h"

namespace zel {

enum class ControlKind {
    Button,
    CheckBox,
    DropDownList,
    Frame,
    Graph,
    Graph3D,
    Label,
    ListBox,
    MenuItem,
    OptionButton,
    Picture,
    RichText,
    Slider,
    TextBox,
    Timer,
};

/// Colours as the panel counts them: red + 256 * green + 65536 * blue; the high bit marks a
/// colour of the platform's theme.
using Color = std::uint32_t;
constexpr Color kButtonFace = 0x8000000F;
constexpr Color kWindowBackground = 0x80000005;
constexpr Color kWindowText = 0x80000008;
constexpr Color kRed = 255;
constexpr Color kGreen = 49152;

class Form;

/// A named control. It registers with its form, in the order of declaration, which is the tab
/// order as well.
class Control : public PropertyOwner {
  public:
    Control(Form& form, std::string name, ControlKind kind);
    Control(const Control&) = delete;
    Control& operator=(const Control&) = delete;
    virtual ~Control() = default;

    const std::string& name() const { return name_; }
    ControlKind kind() const { return kind_; }
    Form& form() const { return form_; }

    /// One event for all properties: a front end reads the control again.
    Event<> Changed;
    void noteChange() override { Changed(); }

    Property<bool> Visible{this, true};
    Property<bool> Enabled{this, true};
    Property<Color> BackColor{this, kButtonFace};
    Property<Color> ForeColor{this, kWindowText};
    Property<std::string> ToolTip{this, ""};

  private:
    Form& form_;
    std::string name_;
    ControlKind kind_;
};

/// A public variable of a form, reachable by its name. A flag is a bool.
using VariableRef =
    std::variant<const bool*, const std::uint8_t*, const std::int16_t*, const std::int32_t*,
                 const double*, const std::string*, const std::vector<double>*>;

struct Variable {
    std::string name;
    VariableRef value;
};

/// A window as data. `Visible` and `Modal` are what a front end shows; `MousePointer` is 11 for
/// the hourglass and 0 for the normal pointer.
class Form : public PropertyOwner {
  public:
    explicit Form(std::string name) : name_(std::move(name)) {}
    Form(const Form&) = delete;
    Form& operator=(const Form&) = delete;
    virtual ~Form() = default;

    const std::string& name() const { return name_; }
    const std::vector<Control*>& controls() const { return controls_; }
    const std::vector<Variable>& variables() const { return variables_; }
    /// The control of that name ("SoftKey(2)" for an element), or null. Case counts.
    Control* control(std::string_view name) const;
    const Variable* variable(std::string_view name) const;

    Event<> Changed;
    void noteChange() override { Changed(); }

    Property<std::string> Caption{this, ""};
    Property<bool> Visible{this, false};
    Property<bool> Modal{this, false};
    Property<int> MousePointer{this, 0};

    /// A key on a control that has no handler of its own for keys: key code, shift.
    Event<int, int> KeyDown;

    /// Before each showing of a form that is not loaded; see `load`.
    Event<> Load;
    /// The user closes the window; a handler sets the argument to -1 to keep it.
    Event<int&> QueryUnload;
    /// The unload handler; the argument is the cancel word that callers pass (1).
    Event<int> Unload;

    /// Runs `Load` once until `unload`.
    void load();
    void unload(int argument);
    bool loaded() const { return loaded_; }

    void Show() {
        load();
        Visible = true;
    }
    void Hide() { Visible = false; }

  protected:
    void addVariables(std::vector<Variable> variables);

  private:
    friend class Control;
    std::string name_;
    std::vector<Control*> controls_;
    std::vector<Variable> variables_;
    bool loaded_ = false;
};

}  // namespace zel
