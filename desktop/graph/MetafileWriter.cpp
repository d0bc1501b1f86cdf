#include "desktop/graph/MetafileWriter.h"

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <initializer_list>
#include <limits>
#include <optional>
#include <string>
#include <vector>

#include "support/Windows1252.h"

namespace zel {
namespace {

// Functions of records.
constexpr int kSaveDC = 0x001E;
constexpr int kSetBkMode = 0x0102;
constexpr int kSetMapMode = 0x0103;
constexpr int kRestoreDC = 0x0127;
constexpr int kSelectObject = 0x012D;
constexpr int kSetTextAlign = 0x012E;
constexpr int kDeleteObject = 0x01F0;
constexpr int kSetTextColor = 0x0209;
constexpr int kSetWindowOrg = 0x020B;
constexpr int kSetWindowExt = 0x020C;
constexpr int kCreatePenIndirect = 0x02FA;
constexpr int kCreateFontIndirect = 0x02FB;
constexpr int kCreateBrushIndirect = 0x02FC;
constexpr int kPolygon = 0x0324;
constexpr int kPolyline = 0x0325;
constexpr int kIntersectClipRect = 0x0416;
constexpr int kEllipse = 0x0418;
constexpr int kRectangle = 0x041B;
constexpr int kExtTextOut = 0x0A32;

constexpr int kTransparent = 1;
constexpr int kAnisotropic = 8;
constexpr int kBaseLine = 24;
constexpr int kSolidBrush = 0;
constexpr int kHollowBrush = 1;
constexpr int kSwissVariablePitch = 0x22;
constexpr int kTrueTypePrecision = 4;

constexpr std::size_t kLongestPolyline = 4096;
constexpr std::size_t kLongestText = 4096;
constexpr std::size_t kLongestFace = 31;
constexpr qsizetype kHeaderWords = 9;

void appendWord(QByteArray& bytes, int value) {
    bytes.append(static_cast<char>(value & 0xFF));
    bytes.append(static_cast<char>(value >> 8 & 0xFF));
}

void appendLong(QByteArray& bytes, qsizetype value) {
    appendWord(bytes, static_cast<int>(value & 0xFFFF));
    appendWord(bytes, static_cast<int>(value >> 16 & 0xFFFF));
}

/// A signed coordinate.
void appendCoordinate(QByteArray& bytes, int value) {
    constexpr int kLeast = std::numeric_limits<std::int16_t>::min();
    constexpr int kMost = std::numeric_limits<std::int16_t>::max();
    appendWord(bytes, std::clamp(value, kLeast, kMost));
}

void appendColor(QByteArray& bytes, MetafileColor color) {
    appendLong(bytes, static_cast<qsizetype>(color & 0xFFFFFF));
}

void appendPoints(QByteArray& bytes, const MetafilePoint* points, std::size_t count) {
    appendWord(bytes, static_cast<int>(count));
    for (std::size_t i = 0; i < count; ++i) {
        appendCoordinate(bytes, points[i].x);
        appendCoordinate(bytes, points[i].y);
    }
}

void appendPadded(QByteArray& bytes, const std::string& text) {
    bytes.append(text.data(), static_cast<qsizetype>(text.size()));
    if (text.size() % 2 != 0) bytes.append('\0');
}

/// Records name the sides of a rectangle from the last to the first.
QByteArray sides(const MetafileRect& rect) {
    QByteArray bytes;
    for (const int side : {rect.bottom, rect.right, rect.top, rect.left})
        appendCoordinate(bytes, side);
    return bytes;
}

struct Spelling {
    char16_t sign;
    const char* bytes;
};
/// What stands for signs that have no byte.
constexpr Spelling kSpellings[] = {
    {u'\u2126', "Ohm"},   // ohm sign
    {u'\u03A9', "Ohm"},   // capital omega
    {u'\u03BC', "\xB5"},  // small mu
    {u'\u2212', "-"},     // minus sign
    {u'\u2009', " "},     // thin blank
    {u'\u202F', " "},     // narrow blank
};

std::string spelled(QChar sign) {
    const char16_t code = sign.unicode();
    const std::optional<char> byte = windows1252Byte(code);
    const bool printable = code >= 0x20 && code != 0x7F;
    if (byte && printable) return {*byte};
    for (const Spelling& spelling : kSpellings)
        if (spelling.sign == code) return spelling.bytes;
    return "?";
}

}  // namespace

MetafileWriter::MetafileWriter(int width, int height, int unitsPerInch)
    : width_(width), height_(height), unitsPerInch_(unitsPerInch) {
    record(kSetMapMode, {kAnisotropic});
    record(kSetWindowOrg, {0, 0});
    record(kSetWindowExt, {height, width});
    // Back there at the end, none of the objects is selected any more and all can be deleted.
    record(kSaveDC, QByteArray());
}

void MetafileWriter::record(int function, const QByteArray& parameters) {
    const qsizetype words = 3 + parameters.size() / 2;
    appendLong(records_, words);
    appendWord(records_, function);
    records_.append(parameters);
    largest_ = std::max(largest_, words);
}

void MetafileWriter::record(int function, std::initializer_list<int> words) {
    QByteArray parameters;
    for (const int word : words) appendCoordinate(parameters, word);
    record(function, parameters);
}

/// A new object gets the lowest slot that is free, so that is where it is looked for.
std::size_t MetafileWriter::freeSlot() {
    std::size_t oldest = kSlots;
    for (std::size_t i = 0; i < kSlots; ++i) {
        if (!slots_[i].used) return i;
        const int index = static_cast<int>(i);
        const auto selectedIn = [index](const Context& context) {
            return std::ranges::find(context.selected, index) != context.selected.end();
        };
        if (selectedIn(now_) || selectedIn(saved_)) continue;
        if (oldest == kSlots || slots_[i].lastUse < slots_[oldest].lastUse) oldest = i;
    }
    record(kDeleteObject, {static_cast<int>(oldest)});
    slots_[oldest].used = false;
    return oldest;
}

void MetafileWriter::select(Kind kind, int function, const QByteArray& parameters) {
    auto found = std::ranges::find_if(slots_, [&](const Slot& slot) {
        return slot.used && slot.function == function && slot.parameters == parameters;
    });
    if (found == slots_.end()) {
        const std::size_t index = freeSlot();
        record(function, parameters);
        slots_[index] = {true, function, parameters, 0};
        slotsUsed_ = std::max(slotsUsed_, index + 1);
        found = slots_.begin() + static_cast<std::ptrdiff_t>(index);
    }
    found->lastUse = ++uses_;
    const int index = static_cast<int>(found - slots_.begin());
    int& selected = now_.selected.at(static_cast<std::size_t>(kind));
    if (selected == index) return;
    selected = index;
    record(kSelectObject, {index});
}

void MetafileWriter::selectPen(const MetafilePen& pen) {
    QByteArray parameters;
    appendWord(parameters, pen.style);
    appendCoordinate(parameters, pen.width);
    appendCoordinate(parameters, 0);
    appendColor(parameters, pen.color);
    select(Pen, kCreatePenIndirect, parameters);
}

void MetafileWriter::selectBrush(std::optional<MetafileColor> color) {
    QByteArray parameters;
    appendWord(parameters, color ? kSolidBrush : kHollowBrush);
    appendColor(parameters, color.value_or(0));
    appendWord(parameters, 0);
    select(Brush, kCreateBrushIndirect, parameters);
}

void MetafileWriter::selectFont(const MetafileFont& font) {
    QByteArray parameters;
    appendCoordinate(parameters, -font.emHeight);  // below 0: the em's height, not the cell's
    appendCoordinate(parameters, 0);
    appendCoordinate(parameters, font.tenthDegrees);
    appendCoordinate(parameters, font.tenthDegrees);
    appendCoordinate(parameters, font.weight);
    for (const int byte : {font.italic ? 1 : 0, font.underline ? 1 : 0, font.strikeOut ? 1 : 0, 0,
                           kTrueTypePrecision, 0, 0, kSwissVariablePitch})
        parameters.append(static_cast<char>(byte));
    std::string face = font.face.substr(0, kLongestFace);
    face.push_back('\0');
    appendPadded(parameters, face);
    select(Font, kCreateFontIndirect, parameters);
}

void MetafileWriter::setTextColor(MetafileColor color) {
    if (now_.textColor == color) return;
    now_.textColor = color;
    QByteArray parameters;
    appendColor(parameters, color);
    record(kSetTextColor, parameters);
}

void MetafileWriter::restore() {
    record(kRestoreDC, {-1});
    now_ = saved_;
    saved_ = {};
    now_.textMode = false;  // some readers lose it here
}

void MetafileWriter::setClip(const std::optional<MetafileRect>& clip) {
    if (clip == clip_) return;
    if (clip_) restore();
    clip_ = clip;
    if (!clip) return;
    record(kSaveDC, QByteArray());
    saved_ = now_;
    record(kIntersectClipRect, sides(*clip));
}

void MetafileWriter::polyline(const std::vector<MetafilePoint>& points) {
    for (std::size_t first = 0; first + 1 < points.size(); first += kLongestPolyline - 1) {
        QByteArray parameters;
        appendPoints(parameters, &points[first], std::min(kLongestPolyline, points.size() - first));
        record(kPolyline, parameters);
    }
}

void MetafileWriter::polygon(const std::vector<MetafilePoint>& points) {
    if (points.empty() || points.size() > std::numeric_limits<std::int16_t>::max()) return;
    QByteArray parameters;
    appendPoints(parameters, points.data(), points.size());
    record(kPolygon, parameters);
}

void MetafileWriter::rectangle(const MetafileRect& rect) { record(kRectangle, sides(rect)); }

void MetafileWriter::ellipse(const MetafileRect& rect) { record(kEllipse, sides(rect)); }

void MetafileWriter::text(MetafilePoint origin, const std::string& bytes,
                          const std::vector<int>& advances) {
    const std::string kept = bytes.substr(0, kLongestText);
    if (kept.empty()) return;
    if (!now_.textMode) {
        record(kSetBkMode, {kTransparent});
        record(kSetTextAlign, {kBaseLine});
        now_.textMode = true;
    }
    QByteArray parameters;
    appendCoordinate(parameters, origin.y);
    appendCoordinate(parameters, origin.x);
    appendWord(parameters, static_cast<int>(kept.size()));
    appendWord(parameters, 0);
    appendPadded(parameters, kept);
    if (advances.size() >= kept.size())
        for (std::size_t i = 0; i < kept.size(); ++i) appendCoordinate(parameters, advances[i]);
    record(kExtTextOut, parameters);
}

QByteArray MetafileWriter::finish() {
    setClip({});
    restore();
    for (std::size_t i = 0; i < kSlots; ++i)
        if (slots_[i].used) record(kDeleteObject, {static_cast<int>(i)});
    record(0, QByteArray());

    QByteArray file;
    appendLong(file, 0x9AC6CDD7);
    appendWord(file, 0);
    for (const int side : {0, 0, width_, height_}) appendCoordinate(file, side);
    appendWord(file, unitsPerInch_);
    appendLong(file, 0);
    int checksum = 0;
    for (qsizetype i = 0; i < file.size(); i += 2)
        checksum ^= static_cast<unsigned char>(file[i]) | static_cast<unsigned char>(file[i + 1])
                                                              << 8;
    appendWord(file, checksum);

    appendWord(file, 1);  // kept in memory, not in a file
    appendWord(file, kHeaderWords);
    appendWord(file, 0x0300);
    appendLong(file, kHeaderWords + records_.size() / 2);
    appendWord(file, static_cast<int>(slotsUsed_));
    appendLong(file, largest_);
    appendWord(file, 0);
    return file + records_;
}

std::string metafileText(const QString& text) {
    std::string bytes;
    for (const QChar sign : text) {
        if (sign.isLowSurrogate()) continue;  // the first half stands for the sign
        bytes += spelled(sign);
    }
    return bytes;
}

}  // namespace zel
