// Windows metafiles: the records, and the paint engine over them.

#include <gtest/gtest.h>

#include <QPainter>
#include <cmath>
#include <limits>

#include "desktop/graph/MetafileEngine.h"
#include "desktop/graph/PolylineClip.h"
#include "tests/desktop/WindowTest.h"
#include "tests/desktop/graph/MetafilePlayer.h"

namespace zel {
namespace {

using Faults = std::vector<std::string>;
constexpr int kUnits = 20;  // in a pixel

PlayedMetafile finished(MetafileWriter& writer) {
    PlayedMetafile played = playMetafile(writer.finish());
    EXPECT_EQ(played.faults, Faults());
    return played;
}

/// What a painter leaves behind on a picture of 400 x 300 pixels.
template <class Painting>
PlayedMetafile painted(Painting&& paint) {
    testApplication();
    MetafileDevice device({400, 300}, 96);
    QPainter painter(&device);
    paint(painter);
    painter.end();
    PlayedMetafile played = playMetafile(device.finish());
    EXPECT_EQ(played.faults, Faults());
    return played;
}

TEST(MetafileWriter, EmptyPicture_HasBothHeadersAndAnEnd) {
    MetafileWriter writer(1000, 500, 1440);
    const PlayedMetafile played = finished(writer);
    EXPECT_EQ(played.box, QRect(QPoint(0, 0), QPoint(1000, 500)));
    EXPECT_EQ(played.unitsPerInch, 1440);
    EXPECT_EQ(played.window, QSize(1000, 500));
    EXPECT_EQ(played.handles, 0);
}

TEST(MetafileWriter, SameObject_IsMadeOnce) {
    MetafileWriter writer(1000, 500, 1440);
    for (int i = 0; i < 5; ++i) {
        writer.selectPen({MetafilePen::Solid, 3, 0x102030});
        writer.polyline({{0, 0}, {i, 9}});
        writer.selectPen({MetafilePen::Solid, 4, 0x102030});
        writer.polyline({{0, 0}, {i, 9}});
    }
    const PlayedMetafile played = finished(writer);
    EXPECT_EQ(played.objectsMade, 2);
    EXPECT_EQ(played.handles, 2);
    ASSERT_EQ(played.drawn.size(), 10U);
    EXPECT_EQ(played.drawn[8].pen.width, 3);
    EXPECT_EQ(played.drawn[9].pen.width, 4);
    EXPECT_EQ(played.drawn[9].pen.color, QColor(0x30, 0x20, 0x10));
}

TEST(MetafileWriter, MoreObjectsThanSlots_TakeThePlacesOfTheOldest) {
    MetafileWriter writer(1000, 500, 1440);
    for (int i = 1; i <= 100; ++i) {
        if (i % 7 == 0) writer.setClip(MetafileRect{0, 0, i, i});
        writer.selectBrush(static_cast<MetafileColor>(i));
        writer.selectPen({MetafilePen::Solid, i, 0});
        writer.rectangle({0, 0, i, i});
        if (i % 11 == 0) writer.setClip({});
    }
    const PlayedMetafile played = finished(writer);
    EXPECT_EQ(played.handles, 12);
    ASSERT_EQ(played.drawn.size(), 100U);
    for (int i = 1; i <= 100; ++i) {
        const Drawn& drawn = played.drawn[static_cast<std::size_t>(i - 1)];
        EXPECT_EQ(drawn.pen.width, i);
        EXPECT_EQ(drawn.brush, QColor(i, 0, 0));
    }
}

TEST(MetafileWriter, EndOfAClip_BringsPenAndTextColorBackInStep) {
    MetafileWriter writer(1000, 500, 1440);
    const auto draw = [&](int width, MetafileColor color) {
        writer.selectPen({MetafilePen::Solid, width, 0});
        writer.polyline({{0, 0}, {5, 5}});
        writer.selectFont({200, 0, 400, false, false, false, "Arial"});
        writer.setTextColor(color);
        writer.text({1, 2}, "a", {9});
    };
    draw(1, 1);
    writer.setClip(MetafileRect{10, 20, 30, 40});
    draw(2, 2);
    writer.setClip({});
    draw(2, 2);
    const PlayedMetafile played = finished(writer);
    ASSERT_EQ(played.drawn.size(), 6U);
    EXPECT_FALSE(played.drawn[0].clip);
    EXPECT_EQ(played.drawn[2].clip, QRect(QPoint(10, 20), QPoint(30, 40)));
    EXPECT_FALSE(played.drawn[4].clip);
    EXPECT_EQ(played.drawn[4].pen.width, 2);
    EXPECT_EQ(played.drawn[5].textColor, QColor(2, 0, 0));
    for (const std::size_t text : {1U, 3U, 5U}) {
        EXPECT_TRUE(played.drawn[text].transparent);
        EXPECT_EQ(played.drawn[text].alignment, 24);
    }
}

TEST(MetafileWriter, NextClip_TakesThePlaceOfTheLast) {
    MetafileWriter writer(1000, 500, 1440);
    writer.setClip(MetafileRect{0, 0, 10, 10});
    writer.polyline({{0, 0}, {5, 5}});
    writer.setClip(MetafileRect{50, 50, 90, 90});
    writer.polyline({{60, 60}, {70, 70}});
    const PlayedMetafile played = finished(writer);
    EXPECT_EQ(played.drawn.at(1).clip, QRect(QPoint(50, 50), QPoint(90, 90)));
}

TEST(MetafileWriter, LongPolyline_IsSplitWhereThePartsMeet) {
    MetafileWriter writer(30000, 500, 1440);
    std::vector<MetafilePoint> line;
    line.reserve(10000);
    for (int i = 0; i < 10000; ++i) line.push_back({i, i % 7});
    writer.polyline(line);
    const PlayedMetafile played = finished(writer);
    ASSERT_EQ(played.drawn.size(), 3U);
    std::vector<QPoint> joined = played.drawn[0].points;
    for (std::size_t i = 1; i < played.drawn.size(); ++i) {
        const std::vector<QPoint>& part = played.drawn[i].points;
        EXPECT_LE(part.size(), 4096U);
        EXPECT_EQ(joined.back(), part.front());
        joined.insert(joined.end(), part.begin() + 1, part.end());
    }
    ASSERT_EQ(joined.size(), line.size());
    EXPECT_EQ(joined.back(), QPoint(9999, 9999 % 7));
}

TEST(MetafileWriter, PolylineOfExactlyOneRecordMore_LeavesNoLonelyPoint) {
    MetafileWriter writer(30000, 500, 1440);
    writer.polyline(std::vector<MetafilePoint>(4096, {1, 1}));
    writer.polyline({{1, 1}});
    writer.polyline({});
    EXPECT_EQ(finished(writer).drawn.size(), 1U);
}

TEST(MetafileWriter, CoordinatePastSixteenBits_EndsAtTheLimit) {
    MetafileWriter writer(1000, 500, 1440);
    writer.polyline({{-100000, 100000}, {32768, -32769}});
    const PlayedMetafile played = finished(writer);
    EXPECT_EQ(played.drawn.at(0).points, (std::vector<QPoint>{{-32768, 32767}, {32767, -32768}}));
}

TEST(MetafileWriter, OddTextAndLongFace_ArePaddedAndCut) {
    MetafileWriter writer(1000, 500, 1440);
    writer.selectFont({200, 900, 700, true, false, false, std::string(60, 'x')});
    writer.text({10, 20}, "abc", {1, 2, 3});
    writer.text({10, 20}, "", {});
    writer.text({10, 20}, "abcd", {});
    const PlayedMetafile played = finished(writer);
    ASSERT_EQ(played.drawn.size(), 2U);
    EXPECT_EQ(played.drawn[0].text, "abc");
    EXPECT_EQ(played.drawn[0].advances, (std::vector<int>{1, 2, 3}));
    EXPECT_EQ(played.drawn[0].points.at(0), QPoint(10, 20));
    EXPECT_EQ(played.drawn[0].font.height, -200);
    EXPECT_EQ(played.drawn[0].font.escapement, 900);
    EXPECT_EQ(played.drawn[0].font.weight, 700);
    EXPECT_TRUE(played.drawn[0].font.italic);
    EXPECT_EQ(played.drawn[0].font.face, std::string(31, 'x'));
    EXPECT_EQ(played.drawn[1].advances, std::vector<int>());
}

TEST(MetafileText, EachSign_HasItsByteOrASensibleStandIn) {
    EXPECT_EQ(metafileText("10dB/DIV"), "10dB/DIV");
    EXPECT_EQ(metafileText("20 \u00B5s 5 \u03BCs"), "20 \xB5s 5 \xB5s");
    EXPECT_EQ(metafileText("50 \u03A9, 75 \u2126"), "50 Ohm, 75 Ohm");
    EXPECT_EQ(metafileText("\u22123 \u20AC \u2026"), "-3 \x80 \x85");
    EXPECT_EQ(metafileText("\u4E2D\U0001F600\tx\u0081"), "???x?");
    EXPECT_EQ(metafileText(""), "");
}

TEST(PolylineClip, Line_IsCutWhereItCrossesTheEdge) {
    const auto parts = clipPolyline({{-10, 5}, {5, 5}, {5, 20}}, {0, 0, 10, 10});
    ASSERT_EQ(parts.size(), 1U);
    EXPECT_EQ(parts[0], (QPolygonF{QPointF{0, 5}, QPointF{5, 5}, QPointF{5, 10}}));
}

TEST(PolylineClip, LineThatComesBack_HasTwoParts) {
    const auto parts = clipPolyline({{2, 5}, {2, 50}, {4, 50}, {4, 5}}, {0, 0, 10, 10});
    ASSERT_EQ(parts.size(), 2U);
    EXPECT_EQ(parts[0], (QPolygonF{QPointF{2, 5}, QPointF{2, 10}}));
    EXPECT_EQ(parts[1], (QPolygonF{QPointF{4, 10}, QPointF{4, 5}}));
}

TEST(PolylineClip, PeakPastTheEdge_KeepsItsSlopes) {
    const auto parts = clipPolyline({{0, 0}, {5, 20}, {10, 0}}, {0, 0, 10, 10});
    ASSERT_EQ(parts.size(), 2U);
    EXPECT_EQ(parts[0], (QPolygonF{QPointF{0, 0}, QPointF{2.5, 10}}));
    EXPECT_EQ(parts[1], (QPolygonF{QPointF{7.5, 10}, QPointF{10, 0}}));
}

TEST(PolylineClip, LineThatIsSeenBetweenItsPointsOnly_Remains) {
    const auto parts = clipPolyline({{-1e9, 5}, {1e9, 5}}, {0, 0, 10, 10});
    ASSERT_EQ(parts.size(), 1U);
    ASSERT_EQ(parts[0].size(), 2);
    EXPECT_NEAR(parts[0].front().x(), 0, 1e-6);
    EXPECT_NEAR(parts[0].back().x(), 10, 1e-6);
    EXPECT_EQ(parts[0].back().y(), 5);
}

TEST(PolylineClip, LineOutside_LeavesNothing) {
    EXPECT_TRUE(clipPolyline({{-5, -5}, {20, -5}}, {0, 0, 10, 10}).empty());
    EXPECT_TRUE(clipPolyline({{-5, 8}, {2, 16}}, {0, 0, 10, 10}).empty());
    EXPECT_TRUE(clipPolyline({{5, 5}}, {0, 0, 10, 10}).empty());
    EXPECT_TRUE(clipPolyline({}, {0, 0, 10, 10}).empty());
}

TEST(PolylineClip, PointThatIsNoNumber_InterruptsTheLine) {
    const double nan = std::numeric_limits<double>::quiet_NaN();
    const double inf = std::numeric_limits<double>::infinity();
    const auto parts =
        clipPolyline({{1, 1}, {2, 2}, {nan, 3}, {4, 4}, {5, 5}, {6, inf}}, {0, 0, 10, 10});
    ASSERT_EQ(parts.size(), 2U);
    EXPECT_EQ(parts[0], (QPolygonF{QPointF{1, 1}, QPointF{2, 2}}));
    EXPECT_EQ(parts[1], (QPolygonF{QPointF{4, 4}, QPointF{5, 5}}));
}

TEST(MetafileEngine, Polyline_StaysInsideOfTheClip) {
    const PlayedMetafile played = painted([](QPainter& painter) {
        painter.setClipRect(QRect(50, 50, 100, 80));
        painter.setPen(QPen(QColor(1, 2, 3), 2));
        painter.drawPolyline((QPolygonF{QPointF{0, 0}, QPointF{100, 100}, QPointF{1e7, 90},
                                        QPointF{60, -1e7}, QPointF{60, 60}}));
    });
    const QRect clip(QPoint(50 * kUnits, 50 * kUnits), QPoint(150 * kUnits, 130 * kUnits));
    ASSERT_GE(played.drawn.size(), 2U);
    for (const Drawn& drawn : played.drawn) {
        EXPECT_EQ(drawn.clip, clip);
        EXPECT_EQ(drawn.pen.width, 2 * kUnits);
        EXPECT_EQ(drawn.pen.color, QColor(1, 2, 3));
        for (const QPoint& point : drawn.points) EXPECT_TRUE(clip.contains(point));
    }
}

TEST(MetafileEngine, ClipWithinAClip_IsTheirCommonPartUntilItIsRestored) {
    const PlayedMetafile played = painted([](QPainter& painter) {
        painter.setClipRect(QRect(50, 50, 100, 80));
        painter.save();
        painter.translate(100, 0);
        painter.setClipRect(QRect(0, 0, 400, 60), Qt::IntersectClip);
        painter.drawLine(0, 55, 300, 55);
        painter.restore();
        painter.drawLine(0, 55, 300, 55);
        painter.setClipping(false);
        painter.drawLine(0, 55, 300, 55);
    });
    ASSERT_EQ(played.drawn.size(), 3U);
    const auto box = [](int left, int top, int right, int bottom) {
        return QRect(QPoint(left * kUnits, top * kUnits), QPoint(right * kUnits, bottom * kUnits));
    };
    EXPECT_EQ(played.drawn[0].clip, box(100, 50, 150, 60));
    EXPECT_EQ(played.drawn[1].clip, box(50, 50, 150, 130));
    EXPECT_FALSE(played.drawn[2].clip);
    EXPECT_EQ(played.drawn[2].points.back(), QPoint(300 * kUnits, 55 * kUnits));
}

TEST(MetafileEngine, EmptyClip_HidesEverything) {
    const PlayedMetafile played = painted([](QPainter& painter) {
        painter.setClipRect(QRect(500, 400, 50, 50));
        painter.drawLine(0, 0, 400, 300);
        painter.fillRect(0, 0, 400, 300, Qt::red);
        painter.drawEllipse(10, 10, 50, 50);
        painter.drawText(20, 20, "hidden");
    });
    EXPECT_TRUE(played.drawn.empty());
}

TEST(MetafileEngine, DashedLine_IsDrawnDashByDash) {
    const PlayedMetafile played = painted([](QPainter& painter) {
        QPen pen(Qt::red, 2);
        pen.setDashPattern({3, 2});
        painter.setPen(pen);
        painter.drawLine(QPointF(10, 20), QPointF(35, 20));
    });
    ASSERT_EQ(played.drawn.size(), 3U);
    EXPECT_EQ(played.drawn[0].points, (std::vector<QPoint>{{200, 400}, {320, 400}}));
    EXPECT_EQ(played.drawn[1].points, (std::vector<QPoint>{{400, 400}, {520, 400}}));
    EXPECT_EQ(played.drawn[2].points, (std::vector<QPoint>{{600, 400}, {700, 400}}));
    EXPECT_EQ(played.drawn[0].pen.style, 0);
}

TEST(MetafileEngine, Fill_HasNoOutlineAndAnOutlineNoFill) {
    const PlayedMetafile played = painted([](QPainter& painter) {
        painter.fillRect(QRectF(-50, -50, 1000, 1000), QColor(9, 8, 7));
        painter.setPen(QPen(Qt::blue, 3));
        painter.setBrush(Qt::NoBrush);
        painter.drawEllipse(QRectF(100, 100, 20, 10));
        painter.drawRect(QRectF(10, 10, 30, 30));
    });
    ASSERT_EQ(played.drawn.size(), 3U);
    EXPECT_EQ(played.drawn[0].kind, Drawn::Kind::Rectangle);
    EXPECT_EQ(played.drawn[0].pen.style, 5);
    EXPECT_EQ(played.drawn[0].brush, QColor(9, 8, 7));
    EXPECT_EQ(played.drawn[0].points, (std::vector<QPoint>{{0, 0}, {400 * kUnits, 300 * kUnits}}));
    EXPECT_EQ(played.drawn[1].kind, Drawn::Kind::Ellipse);
    EXPECT_FALSE(played.drawn[1].brush);
    EXPECT_EQ(played.drawn[1].pen.width, 3 * kUnits);
    EXPECT_EQ(played.drawn[1].points, (std::vector<QPoint>{{2000, 2000}, {2400, 2200}}));
    EXPECT_EQ(played.drawn[2].kind, Drawn::Kind::Polyline);
    EXPECT_EQ(played.drawn[2].points.size(), 5U);
}

TEST(MetafileEngine, Polygon_IsFilledAndClosed) {
    const PlayedMetafile played = painted([](QPainter& painter) {
        painter.setPen(Qt::black);
        painter.setBrush(Qt::green);
        painter.drawPolygon((QPolygonF{QPointF{10, 10}, QPointF{50, 10}, QPointF{50, 50}}));
    });
    ASSERT_EQ(played.drawn.size(), 2U);
    EXPECT_EQ(played.drawn[0].kind, Drawn::Kind::Polygon);
    EXPECT_EQ(played.drawn[0].brush, QColor(Qt::green));
    EXPECT_EQ(played.drawn[1].points.front(), played.drawn[1].points.back());
    EXPECT_EQ(played.drawn[1].points.size(), 4U);
}

TEST(MetafileEngine, EllipseLargerThanThePicture_IsCutAsALine) {
    const PlayedMetafile played =
        painted([](QPainter& painter) { painter.drawEllipse(QRectF(-5000, 100, 10200, 100)); });
    ASSERT_FALSE(played.drawn.empty());
    for (const Drawn& drawn : played.drawn) EXPECT_EQ(drawn.kind, Drawn::Kind::Polyline);
}

TEST(MetafileEngine, NoPenAndNoBrush_DrawNothing) {
    const PlayedMetafile played = painted([](QPainter& painter) {
        painter.setPen(Qt::NoPen);
        painter.drawRect(10, 10, 30, 30);
        painter.drawEllipse(10, 10, 30, 30);
        painter.drawLine(0, 0, 50, 50);
        painter.setPen(QColor(0, 0, 0, 0));
        painter.drawLine(0, 0, 50, 50);
    });
    EXPECT_TRUE(played.drawn.empty());
}

TEST(MetafileEngine, Text_HasItsFontColorAndWidth) {
    testApplication();  // a font that is made before it has another family
    QFont font;
    font.setPointSize(9);
    font.setBold(true);
    const PlayedMetafile played = painted([&](QPainter& painter) {
        painter.setFont(font);
        painter.setPen(QColor(200, 100, 50));
        painter.drawText(QPointF(30, 40), "20 \u00B5s");
    });
    ASSERT_EQ(played.drawn.size(), 1U);
    const Drawn& text = played.drawn[0];
    EXPECT_EQ(text.text, "20 \xB5s");
    EXPECT_EQ(text.points.at(0), QPoint(30 * kUnits, 40 * kUnits));
    EXPECT_EQ(text.font.height, -12 * kUnits);  // 9 points at 96 dots an inch
    EXPECT_EQ(text.font.weight, 700);
    EXPECT_EQ(text.font.escapement, 0);
    EXPECT_FALSE(text.font.face.empty());
    EXPECT_EQ(text.textColor, QColor(200, 100, 50));
    int width = 0;
    for (const int advance : text.advances) width += advance;
    const MetafileDevice device({400, 300}, 96);
    EXPECT_NEAR(width, QFontMetricsF(font, &device).horizontalAdvance("20 \u00B5s") * kUnits, 2);
}

TEST(MetafileEngine, TurnedText_IsTurnedByItsFont) {
    const PlayedMetafile played = painted([](QPainter& painter) {
        painter.translate(50, 200);
        painter.rotate(-90);
        painter.drawText(QPointF(10, 5), "dBm");
    });
    ASSERT_EQ(played.drawn.size(), 1U);
    EXPECT_EQ(played.drawn[0].font.escapement, 900);
    EXPECT_EQ(played.drawn[0].points.at(0), QPoint(55 * kUnits, 190 * kUnits));
    EXPECT_TRUE(played.drawn[0].advances.empty());
}

TEST(MetafileEngine, HugePicture_StillFitsInSixteenBits) {
    testApplication();
    MetafileDevice device({40000, 100}, 96);
    QPainter painter(&device);
    painter.drawLine(0, 50, 40000, 50);
    painter.end();
    const PlayedMetafile played = playMetafile(device.finish());
    EXPECT_EQ(played.faults, Faults());
    EXPECT_EQ(played.window.width(), 32000);
    EXPECT_EQ(played.drawn.at(0).points.back(), QPoint(32000, 40));
}

}  // namespace
}  // namespace zel
