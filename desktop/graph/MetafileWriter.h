#pragma once
// Writes the records of a placeable Windows metafile.

#include <QByteArray>
#include <QString>
#include <array>
#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>
#include <vector>

namespace zel {

struct MetafilePoint {
    int x = 0;
    int y = 0;
};

struct MetafileRect {
    int left = 0;
    int top = 0;
    int right = 0;
    int bottom = 0;
    bool operator==(const MetafileRect&) const = default;
};

/// 0x00BBGGRR.
using MetafileColor = std::uint32_t;

struct MetafilePen {
    enum Style : int { Solid = 0, Null = 5 };  ///< as the record names them
    Style style = Solid;
    int width = 1;
    MetafileColor color = 0;
};

struct MetafileFont {
    int emHeight = 0;
    int tenthDegrees = 0;  ///< counterclockwise, of the line of text
    int weight = 400;
    bool italic = false;
    bool underline = false;
    bool strikeOut = false;
    std::string face;  ///< Windows-1252, at most 31 bytes count
};

/// A picture of width x height units, of which `unitsPerInch` make an inch. All coordinates and
/// measures are such units; what does not fit in 16 bits ends at their limits. Objects are kept
/// and used again; the oldest make room for new ones.
class MetafileWriter {
  public:
    MetafileWriter(int width, int height, int unitsPerInch);

    void selectPen(const MetafilePen& pen);
    /// None leaves shapes hollow.
    void selectBrush(std::optional<MetafileColor> color);
    void selectFont(const MetafileFont& font);
    void setTextColor(MetafileColor color);
    /// What follows is seen inside of the rectangle only, from the last clip on again; none ends
    /// it.
    void setClip(const std::optional<MetafileRect>& clip);

    /// A long line becomes several records, which share the points where they meet.
    void polyline(const std::vector<MetafilePoint>& points);
    /// Nothing when it has more points than a record can count.
    void polygon(const std::vector<MetafilePoint>& points);
    void rectangle(const MetafileRect& rect);
    void ellipse(const MetafileRect& rect);
    /// Windows-1252 bytes from the left end of the base line; `advances` has the way from each
    /// character to the next, or is empty: the reader then places them.
    void text(MetafilePoint origin, const std::string& bytes, const std::vector<int>& advances);

    /// The whole file, its headers filled in. Nothing may be written after it.
    QByteArray finish();

  private:
    enum Kind : int { Pen, Brush, Font, kKinds };
    static constexpr int kNone = -1;
    static constexpr std::size_t kSlots = 12;
    using Selection = std::array<int, kKinds>;
    struct Slot {
        bool used = false;
        int function = 0;
        QByteArray parameters;
        std::uint64_t lastUse = 0;
    };
    struct Context {
        Selection selected{kNone, kNone, kNone};
        std::optional<MetafileColor> textColor;
        bool textMode = false;  ///< how text is placed was written
    };

    void record(int function, const QByteArray& parameters);
    void record(int function, std::initializer_list<int> words);
    void select(Kind kind, int function, const QByteArray& parameters);
    std::size_t freeSlot();
    void restore();

    QByteArray records_;
    int width_;
    int height_;
    int unitsPerInch_;
    qsizetype largest_ = 0;  ///< record, in words
    std::size_t slotsUsed_ = 0;
    std::uint64_t uses_ = 0;
    std::array<Slot, kSlots> slots_;
    Context now_;
    Context saved_;  ///< to which the end of the clip goes back
    std::optional<MetafileRect> clip_;
};

/// The bytes of a text in Windows-1252. An ohm sign is spelled out, other signs without a byte
/// become a question mark.
std::string metafileText(const QString& text);

}  // namespace zel
