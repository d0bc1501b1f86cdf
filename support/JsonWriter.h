#pragma once
// Writes JSON, value by value.

#include <string>
#include <string_view>

namespace zel {

/// The commas come by themselves. A number that is not finite becomes null, or the text "inf" or
/// "-inf"; other numbers have the shortest digits that read back exactly. Of a text that is
/// no UTF-8 each wrong byte becomes the replacement character.
class JsonWriter {
  public:
    /// `[` and `]` or `{` and `}` around what comes between the two calls.
    JsonWriter& beginObject() { return begin('{'); }
    JsonWriter& endObject() { return end('}'); }
    JsonWriter& beginList() { return begin('['); }
    JsonWriter& endList() { return end(']'); }

    /// The name of the member that comes next.
    JsonWriter& name(std::string_view text);
    JsonWriter& value(double number);
    JsonWriter& value(int number);
    JsonWriter& value(bool flag);
    JsonWriter& value(std::string_view text);
    JsonWriter& value(const char* text) { return value(std::string_view(text)); }
    /// A list of numbers.
    template <typename Numbers>
    JsonWriter& values(const Numbers& numbers) {
        beginList();
        for (const auto number : numbers) value(number);
        return endList();
    }
    template <typename Value>
    JsonWriter& member(std::string_view memberName, const Value& memberValue) {
        return name(memberName).value(memberValue);
    }

    const std::string& text() const { return text_; }

  private:
    JsonWriter& begin(char bracket);
    JsonWriter& end(char bracket);
    /// A comma where one is needed.
    void separate();
    void quote(std::string_view text);

    std::string text_;
    bool first_ = true;  ///< nothing stands before in this list or object, or the name does
};

}  // namespace zel
