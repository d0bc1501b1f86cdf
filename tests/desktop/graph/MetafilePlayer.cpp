#include "tests/desktop/graph/MetafilePlayer.h"

#include <algorithm>
#include <cstdint>
#include <map>

namespace zel {
namespace {

struct Object {
    char kind = 0;  ///< pen, brush, font; 0 is a free slot
    PlayedPen pen;
    std::optional<QColor> brush;
    PlayedFont font;
};

struct Context {
    std::map<char, int> selected;
    Drawn state;
};

class Player {
  public:
    explicit Player(const QByteArray& file) : file_(file) {}

    PlayedMetafile play() {
        readHeaders();
        qsizetype at = 40;
        bool ended = false;
        qsizetype largest = 0;
        while (!ended && at + 6 <= file_.size()) {
            const qsizetype words = longAt(at);
            if (words < 3 || at + words * 2 > file_.size()) {
                fault("record of a wrong size");
                break;
            }
            largest = std::max(largest, words);
            ended = word(at + 4) == 0;
            parameters_ = at + 6;
            end_ = at + words * 2;
            run(word(at + 4));
            at += words * 2;
        }
        if (!ended) fault("no end record");
        if (at != file_.size()) fault("bytes after the end");
        if (longAt(34) != largest) fault("largest record");
        if (!stack_.empty()) fault("a saved context is left");
        for (const Object& object : objects_)
            if (object.kind != 0) fault("an object is left");
        if (out_.handles != slotsUsed_) fault("number of object slots");
        return out_;
    }

  private:
    int byte(qsizetype at) const {
        return at < file_.size() ? static_cast<unsigned char>(file_[at]) : 0;
    }
    int word(qsizetype at) const { return byte(at) | byte(at + 1) << 8; }
    int number(qsizetype at) const { return static_cast<std::int16_t>(word(at)); }
    qsizetype longAt(qsizetype at) const {
        return word(at) | static_cast<qsizetype>(word(at + 2)) << 16;
    }
    /// A parameter of the record at hand.
    int p(int index) const { return number(parameters_ + qsizetype{index} * 2); }
    QColor colorAt(int index) const {
        const qsizetype at = parameters_ + qsizetype{index} * 2;
        return {byte(at), byte(at + 1), byte(at + 2)};
    }
    void fault(const std::string& what) { out_.faults.push_back(what); }

    void readHeaders() {
        if (file_.size() < 46) return fault("too short");
        if (longAt(0) != 0x9AC6CDD7) fault("key");
        int checksum = 0;
        for (int i = 0; i < 20; i += 2) checksum ^= word(i);
        if (word(20) != checksum) fault("checksum");
        out_.box = QRect(QPoint(number(6), number(8)), QPoint(number(10), number(12)));
        out_.unitsPerInch = word(14);
        if (word(22) != 1 || word(24) != 9 || word(26) != 0x300) fault("header");
        if (longAt(28) * 2 != file_.size() - 22) fault("size in the header");
        out_.handles = word(32);
        if (word(38) != 0) fault("number of members");
    }

    void create(Object object) {
        ++out_.objectsMade;
        auto slot = std::find_if(objects_.begin(), objects_.end(),
                                 [](const Object& known) { return known.kind == 0; });
        if (slot == objects_.end()) slot = objects_.insert(slot, Object());
        *slot = std::move(object);
        slotsUsed_ = std::max(slotsUsed_, static_cast<int>(slot - objects_.begin()) + 1);
    }

    Object* objectOf(int index) {
        const bool known = index >= 0 && index < static_cast<int>(objects_.size()) &&
                           objects_[static_cast<std::size_t>(index)].kind != 0;
        if (!known) fault("no object in slot " + std::to_string(index));
        return known ? &objects_[static_cast<std::size_t>(index)] : nullptr;
    }

    void select(int index) {
        const Object* object = objectOf(index);
        if (object == nullptr) return;
        now_.selected[object->kind] = index;
        if (object->kind == 'p') now_.state.pen = object->pen;
        if (object->kind == 'b') now_.state.brush = object->brush;
        if (object->kind == 'f') now_.state.font = object->font;
    }

    void remove(int index) {
        Object* object = objectOf(index);
        if (object == nullptr) return;
        const auto holds = [&](const Context& context) {
            const auto found = context.selected.find(object->kind);
            return found != context.selected.end() && found->second == index;
        };
        if (holds(now_) || std::any_of(stack_.begin(), stack_.end(), holds))
            fault("a selected object is deleted");
        *object = {};
    }

    void draw(Drawn::Kind kind, std::vector<QPoint> points) {
        Drawn drawn = now_.state;
        drawn.kind = kind;
        drawn.points = std::move(points);
        out_.drawn.push_back(std::move(drawn));
    }

    std::vector<QPoint> counted() {
        std::vector<QPoint> points;
        points.reserve(static_cast<std::size_t>(p(0)));
        if (end_ != parameters_ + 2 + qsizetype{p(0)} * 4) fault("count of points");
        for (int i = 0; i < p(0); ++i) points.emplace_back(p(1 + 2 * i), p(2 + 2 * i));
        return points;
    }

    void text() {
        draw(Drawn::Kind::Text, {{p(1), p(0)}});
        const int count = p(2);
        Drawn& drawn = out_.drawn.back();
        drawn.text = file_.mid(parameters_ + 8, count).toStdString();
        const int padded = (count + 1) / 2;
        const int left = static_cast<int>(end_ - parameters_) / 2 - 4 - padded;
        if (left != 0 && left != count) fault("advances of a text");
        for (int i = 0; i < left; ++i) drawn.advances.push_back(p(4 + padded + i));
    }

    void run(int function) {
        const QRect box(QPoint(p(3), p(2)), QPoint(p(1), p(0)));
        switch (function) {
            case 0x001E:
                return stack_.push_back(now_);
            case 0x0127:
                if (stack_.empty()) return fault("nothing to restore");
                now_ = stack_.back();
                return stack_.pop_back();
            case 0x0102:
                now_.state.transparent = p(0) == 1;
                return;
            case 0x012E:
                now_.state.alignment = p(0);
                return;
            case 0x0209:
                now_.state.textColor = colorAt(0);
                return;
            case 0x020C:
                out_.window = {p(1), p(0)};
                return;
            case 0x02FA:
                return create({'p', {p(0), p(1), colorAt(3)}, {}, {}});
            case 0x02FC:
                return create({'b', {}, p(0) == 0 ? std::optional(colorAt(1)) : std::nullopt, {}});
            case 0x02FB:
                return create({'f',
                               {},
                               {},
                               {p(0), p(2), p(4), byte(parameters_ + 10) != 0,
                                file_.mid(parameters_ + 18, end_ - parameters_ - 18).data()}});
            case 0x012D:
                return select(p(0));
            case 0x01F0:
                return remove(p(0));
            case 0x0416:
                now_.state.clip = now_.state.clip ? *now_.state.clip & box : box;
                return;
            case 0x0325:
                return draw(Drawn::Kind::Polyline, counted());
            case 0x0324:
                return draw(Drawn::Kind::Polygon, counted());
            case 0x041B:
                return draw(Drawn::Kind::Rectangle, {box.topLeft(), box.bottomRight()});
            case 0x0418:
                return draw(Drawn::Kind::Ellipse, {box.topLeft(), box.bottomRight()});
            case 0x0A32:
                return text();
            case 0x0000:
            case 0x0103:
            case 0x020B:
                return;
            default:
                return fault("unknown record " + std::to_string(function));
        }
    }

    const QByteArray file_;
    PlayedMetafile out_;
    std::vector<Object> objects_;
    int slotsUsed_ = 0;
    Context now_;
    std::vector<Context> stack_;
    qsizetype parameters_ = 0;
    qsizetype end_ = 0;
};

}  // namespace

std::vector<Drawn> PlayedMetafile::of(Drawn::Kind kind) const {
    std::vector<Drawn> found;
    for (const Drawn& each : drawn)
        if (each.kind == kind) found.push_back(each);
    return found;
}

const Drawn* PlayedMetafile::text(const std::string& wanted) const {
    for (const Drawn& each : drawn)
        if (each.kind == Drawn::Kind::Text && each.text == wanted) return &each;
    return nullptr;
}

PlayedMetafile playMetafile(const QByteArray& file) { return Player(file).play(); }

}  // namespace zel
