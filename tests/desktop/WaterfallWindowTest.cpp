#include <QClipboard>
#include <QComboBox>
#include <QLabel>
#include <QMenu>
#include <QMouseEvent>
#include <QTest>

#include "desktop/graph/SpectrogramWidget.h"
#include "desktop/graph/WaterfallImage.h"
#include "desktop/windows/WaterfallWindow.h"
#include "tests/desktop/WindowTest.h"
#include "waterfall/PictureOptions.h"

namespace zel {
namespace {

constexpr int kNever = 3600'000;

struct WaterfallWindowTest : WindowTest {
    WaterfallForm& form() { return program->forms().waterfall; }
    WaterfallWindow& waterfall() { return *window->findChild<WaterfallWindow*>("WaterfallForm"); }
    WaterfallCanvas& canvas() { return waterfall().canvas(); }
    void flush() {
        window->binder().flush();
        QApplication::processEvents();
    }

    /// Sweeps with a carrier whose burst comes and goes.
    void sweeps(int count) {
        form().Graph3D.setRange(1, 900e6, 1.2e9);
        form().Graph3D.setFormat(1, "k\"Hz\"");
        form().Graph3D.setRange(3, -120, -20);
        form().Graph3D.setFormat(3, "k\"dBm\"");
        form().lblMAX.Caption = "-20 dBm";
        form().lblMin.Caption = "-120 dBm";
        panel().CWGraph1.setXRange(900e6, 1.2e9);
        panel().Shown.xUnit = "Hz";
        panel().CWGraph1.setYRange(-120, -20);
        std::vector<double> x(301);
        std::vector<double> levels(301);
        for (int row = 0; row < count; ++row) {
            for (int i = 0; i < 301; ++i) {
                const auto k = static_cast<std::size_t>(i);
                x[k] = 900e6 + i * 1e6;
                levels[k] = -105 + (i * 7919 + row * 104729) % 9;
                if (i > 96 && i < 104) levels[k] = -40 - (i - 100) * (i - 100);
                if (i > 180 && i < 220 && row % 16 < 8) levels[k] += 30;
            }
            form().limitRows(100);
            form().stampRow("12:00:" + std::to_string(10 + row / 5 % 50));
            panel().CWGraph1.plotY(levels, 900e6, 1e6);
            form().Graph3D.plotCurve(std::vector<double>(301, row), x, levels, levels);
            form().styleLastRow();
        }
        flush();
    }
    /// Without a display another window may lie in front: the pointer moves for the canvas alone.
    void pointAtPlace(const QPointF& place) {
        QMouseEvent move(QEvent::MouseMove, place, canvas().mapToGlobal(place), Qt::NoButton,
                         Qt::NoButton, Qt::NoModifier);
        QApplication::sendEvent(&canvas(), &move);
    }
    /// Until what has changed is drawn.
    void settle() {
        const int before = canvas().drawings();
        flush();
        EXPECT_TRUE(QTest::qWaitFor([&] { return canvas().drawings() > before; }));
    }
    void open(int rows) {
        show();
        sweeps(rows);
        canvas().setStillAfter(kNever);
        panel().cmd3D.Click();
        flush();
    }
};

TEST_F(WaterfallWindowTest, Key_ShowsAndHidesTheWindow) {
    show();
    EXPECT_FALSE(waterfall().isVisible());
    panel().cmd3D.Click();
    flush();
    EXPECT_TRUE(waterfall().isVisible());
    EXPECT_EQ(waterfall().windowTitle(), "Waterfall");
    EXPECT_TRUE(savePicture(waterfall(), "waterfall-empty"));
    panel().cmd3D.Click();
    flush();
    EXPECT_FALSE(waterfall().isVisible());
}

TEST_F(WaterfallWindowTest, CloseByTheFrame_IsTheKey) {
    open(3);
    waterfall().close();
    flush();
    EXPECT_FALSE(waterfall().isVisible());
    EXPECT_FALSE(form().Visible);
    EXPECT_EQ(panel().cmd3D.BackColor.get(), 0xE0E0E0U);
    EXPECT_TRUE(form().Graph3D.hasRows());
}

TEST_F(WaterfallWindowTest, Pictures) {
    open(100);
    EXPECT_TRUE(savePicture(waterfall(), "waterfall"));
    form().ViewSpectrogram.Click();
    settle();
    EXPECT_TRUE(savePicture(waterfall(), "waterfall-from-above"));
    applyTheme(testApplication(), ThemeChoice::Light);
    window->binder().refreshAll();
    form().ViewWaterfall.Click();
    form().ActionMarkers.Click();
    form().Graph3D.CursorPlaced(20, 101);
    waterfall().resize(1024, 560);
    settle();
    EXPECT_TRUE(savePicture(waterfall(), "waterfall-light"));
    panel().SpectrogramShow.Click();
    window->resize(1280, 760);
    flush();
    flush();
    EXPECT_TRUE(savePicture(*window, "spectrogram-light"));
    applyTheme(testApplication(), ThemeChoice::Dark);
    window->binder().refreshAll();
    window->resize(1024, 600);
    flush();
    flush();
    EXPECT_TRUE(savePicture(*window, "spectrogram-small"));
}

TEST_F(WaterfallWindowTest, OtherTheme_RecoloursTheWindowThatIsOpen) {
    open(3);
    const auto corner = [this] { return canvas().grab().toImage().pixelColor(2, 2); };
    EXPECT_LT(corner().lightness(), 60);
    applyTheme(testApplication(), ThemeChoice::Light);
    QApplication::processEvents();
    EXPECT_GT(corner().lightness(), 200);
    applyTheme(testApplication(), ThemeChoice::Dark);
    QApplication::processEvents();
    EXPECT_LT(corner().lightness(), 60);
}

TEST_F(WaterfallWindowTest, PicturesOfSmallAndLargeScreens) {
    open(100);
    panel().SpectrogramShow.Click();
    const QSize sizes[] = {{1024, 600}, {1920, 1080}};
    for (const ThemeChoice theme : {ThemeChoice::Light, ThemeChoice::Dark}) {
        applyTheme(testApplication(), theme);
        window->binder().refreshAll();
        for (const QSize& size : sizes) {
            waterfall().resize(size);
            window->resize(size);
            flush();
            flush();
            EXPECT_EQ(waterfall().size(), size);
            EXPECT_EQ(window->size(), size);
            const QString name = QString("%1_%2")
                                     .arg(size.width())
                                     .arg(theme == ThemeChoice::Light ? "light" : "dark");
            EXPECT_TRUE(savePicture(waterfall(), "waterfall_" + name));
            EXPECT_TRUE(savePicture(*window, "spectrogram_" + name));
        }
    }
}

TEST_F(WaterfallWindowTest, Drag_RotatesAndTellsTheEnd) {
    open(5);
    const GraphView3D before = form().Graph3D.view();
    form().waterfallRotated = false;
    QTest::mousePress(&canvas(), Qt::LeftButton, {}, {100, 100});
    QTest::mouseMove(&canvas(), {140, 90});
    EXPECT_FALSE(form().waterfallRotated);
    QTest::mouseRelease(&canvas(), Qt::LeftButton, {}, {140, 90});
    EXPECT_NE(form().Graph3D.view().Longitude, before.Longitude);
    EXPECT_GT(form().Graph3D.view().Latitude, before.Latitude);
    EXPECT_EQ(form().Graph3D.view().TransX, before.TransX);
    EXPECT_TRUE(form().waterfallRotated);
    EXPECT_EQ(form().WaterfallView.Latitude, form().Graph3D.view().Latitude);
}

TEST_F(WaterfallWindowTest, RightOrShiftDrag_Moves) {
    open(5);
    form().waterfallPanned = false;
    const GraphView3D before = form().Graph3D.view();
    QTest::mousePress(&canvas(), Qt::RightButton, {}, {100, 100});
    QTest::mouseMove(&canvas(), {150, 100});
    QTest::mouseRelease(&canvas(), Qt::RightButton, {}, {150, 100});
    const GraphView3D moved = form().Graph3D.view();
    EXPECT_LT(moved.TransX, before.TransX);
    EXPECT_EQ(moved.Latitude, before.Latitude);
    EXPECT_TRUE(form().waterfallPanned);
    QTest::mousePress(&canvas(), Qt::LeftButton, Qt::ShiftModifier, {150, 100});
    QTest::mouseMove(&canvas(), {100, 100});
    QTest::mouseRelease(&canvas(), Qt::LeftButton, Qt::ShiftModifier, {100, 100});
    EXPECT_NEAR(form().Graph3D.view().TransX, before.TransX, 1e-9);
}

TEST_F(WaterfallWindowTest, Keyboard_DoesTheSame) {
    open(5);
    const GraphView3D before = form().Graph3D.view();
    QTest::keyClick(&canvas(), Qt::Key_Right);
    EXPECT_NE(form().Graph3D.view().Longitude, before.Longitude);
    QTest::keyClick(&canvas(), Qt::Key_Up, Qt::ShiftModifier);
    EXPECT_NE(form().Graph3D.view().TransZ, before.TransZ);
    QTest::keyClick(&canvas(), Qt::Key_Plus);
    EXPECT_LT(form().Graph3D.view().Distance, before.Distance);
    QTest::keyClick(&canvas(), Qt::Key_Minus);
    EXPECT_NEAR(form().Graph3D.view().Distance, before.Distance, 1e-9);
    QTest::keyClick(&canvas(), Qt::Key_Home);
    EXPECT_EQ(form().Graph3D.view(), GraphView3D());
}

TEST_F(WaterfallWindowTest, DoubleClick_Resets) {
    open(5);
    GraphView3D view = form().Graph3D.view();
    view.Distance = 9;
    form().Graph3D.setView(view);
    QTest::mouseDClick(&canvas(), Qt::LeftButton, {}, {100, 100});
    EXPECT_EQ(form().Graph3D.view(), GraphView3D());
}

TEST_F(WaterfallWindowTest, ClickInMarkersMode_PlacesACursorOnTheRow) {
    open(100);
    form().ActionMarkers.Click();
    flush();
    const QPoint middle = canvas().rect().center();
    QTest::mouseClick(&canvas(), Qt::LeftButton, {}, middle);
    ASSERT_EQ(form().Graph3D.cursors().size(), 2U);
    EXPECT_TRUE(form().Graph3D.cursors()[0].placed);
    EXPECT_FALSE(form().Graph3D.cursors()[1].placed);
    QTest::mouseClick(&canvas(), Qt::LeftButton, {}, {1, 1});  // beside the rows
    EXPECT_EQ(form().Graph3D.cursors().size(), 2U);
}

TEST_F(WaterfallWindowTest, Pointer_ReadsFrequencyTimeAndLevelOfTheRowUnderIt) {
    open(100);
    form().ViewSpectrogram.Click();
    form().Graph3D.setView({0, 0, 1, 6, 5, 5});
    flush();
    const Camera camera(form().Graph3D.view(), false, canvas().width(), canvas().height());
    // The carrier at 1 GHz, in row 42.
    const ScreenPoint on = camera.project({12.0 * 100 / 300, 10.0 * 42 / 99, 9});
    pointAtPlace({on.x, on.y});
    EXPECT_TRUE(QTest::qWaitFor([&] { return !form().lblPointer.Caption.get().empty(); }));
    flush();
    const std::string text = form().lblPointer.Caption;
    EXPECT_NE(text.find("Hz   12:00:18   -4"), std::string::npos) << text;
    EXPECT_EQ(widgetOf<QLabel>(form().lblPointer)->text(), QString::fromStdString(text));
    EXPECT_TRUE(savePicture(waterfall(), "waterfall-pointer"));
    pointAtPlace({1, 1});  // beside the rows
    EXPECT_TRUE(QTest::qWaitFor([&] { return form().lblPointer.Caption.get().empty(); }));
}

TEST_F(WaterfallWindowTest, FullScreen_ComesAndGoesByKeyAndEscape) {
    open(100);
    const QSize before = waterfall().size();
    QTest::keyClick(&waterfall(), Qt::Key_F11);
    flush();
    EXPECT_TRUE(form().ViewFullScreen.Checked);
    EXPECT_TRUE(waterfall().isFullScreen());
    EXPECT_TRUE(savePicture(waterfall(), "waterfall-full-screen"));
    QTest::keyClick(&waterfall(), Qt::Key_Escape);
    flush();
    EXPECT_FALSE(waterfall().isFullScreen());
    EXPECT_FALSE(form().ViewFullScreen.Checked);
    EXPECT_TRUE(waterfall().isVisible());  // Escape left the full screen only
    EXPECT_EQ(waterfall().size(), before);
    QTest::keyClick(&waterfall(), Qt::Key_Escape);
    flush();
    EXPECT_FALSE(waterfall().isVisible());
}

TEST_F(WaterfallWindowTest, Lists_ChangeThePicture) {
    open(100);
    const QImage before = canvas().grab().toImage();
    widgetOf<QComboBox>(form().ColourMapList)->setCurrentIndex(2);
    form().ColourMapList.pick(2);
    flush();
    EXPECT_NE(canvas().grab().toImage(), before);
    form().ColourMapList.pick(0);
    form().LevelsList.pick(2);
    EXPECT_TRUE(form().LevelMinBox.Enabled);
    EXPECT_EQ(form().LevelMinBox.Text.get(), "-120");
    form().LevelMinBox.Text = "-110";
    flush();
    EXPECT_NE(canvas().grab().toImage(), before);
    form().LevelMinBox.Text = "rubbish";
    flush();
    EXPECT_EQ(canvas().grab().toImage(), before);
}

TEST_F(WaterfallWindowTest, ColourBar_HasShortNumbersInTheUnitOfItsLabels) {
    show();
    EXPECT_EQ(colourBarText(form(), pictureStyle(form()), true), "");
    form().Graph3D.setRange(3, -117.447274949, -17.447274949);
    form().lblMAX.Caption = "-17.447274949 dBm";
    form().lblMin.Caption = "-117.447274949 dBm";
    EXPECT_EQ(colourBarText(form(), pictureStyle(form()), true), "-17.4 dBm");
    EXPECT_EQ(colourBarText(form(), pictureStyle(form()), false), "-117.4 dBm");
    form().Graph3D.setRange(3, 0, 100);
    form().lblMAX.Caption = "100 %";
    EXPECT_EQ(colourBarText(form(), pictureStyle(form()), true), "100 %");
}

TEST_F(WaterfallWindowTest, SaveAndCopy_GiveThePicture) {
    open(10);
    std::string problem = "none";
    const QString file = QApplication::applicationDirPath() + "/pictures/saved-waterfall.svg";
    form().DrawImage(file.toStdString(), problem);
    EXPECT_EQ(problem, "");
    EXPECT_TRUE(QFile::exists(file));
    for (const auto& [ending, begin] :
         {std::pair<const char*, const char*>{"pdf", "%PDF-"}, {"png", "\x89PNG"}}) {
        QFile other(QApplication::applicationDirPath() + "/pictures/saved-waterfall." + ending);
        form().DrawImage(other.fileName().toStdString(), problem);
        EXPECT_EQ(problem, "");
        ASSERT_TRUE(other.open(QIODevice::ReadOnly));
        EXPECT_TRUE(other.readAll().startsWith(begin)) << ending;
        EXPECT_GT(other.size(), 10000) << ending;
    }
    form().DrawImage("/no/such/folder/x.png", problem);
    EXPECT_NE(problem, "");
    form().DrawImage("x.bmp", problem);
    EXPECT_EQ(problem, "Unknown kind of picture: .bmp (svg, png or pdf)");
    form().PictureCopy.Click();
    EXPECT_FALSE(QGuiApplication::clipboard()->image().isNull());
}

TEST_F(WaterfallWindowTest, NothingChanged_NothingIsComputed) {
    open(20);
    canvas().grab();
    const int before = canvas().drawings();
    canvas().grab();
    waterfall().grab();
    EXPECT_EQ(canvas().drawings(), before);
    GraphView3D view = form().Graph3D.view();
    view.Longitude += 10;
    form().Graph3D.setView(view);
    flush();
    EXPECT_TRUE(QTest::qWaitFor([&] { return canvas().drawings() == before + 1; }));
    waterfall().resize(waterfall().size() + QSize(40, 0));
    canvas().grab();
    EXPECT_EQ(canvas().drawings(), before + 2);
    // A window that nobody sees draws nothing.
    panel().cmd3D.Click();
    flush();
    sweeps(3);
    QTest::qWait(120);
    EXPECT_EQ(canvas().drawings(), before + 2);
}

TEST_F(WaterfallWindowTest, PaintForAnotherReason_LeavesAChangeToTheEndOfTheRest) {
    open(20);
    form().Graph3D.noteChange();
    flush();
    canvas().repaint();
    const int before = canvas().drawings();
    // The rest after that picture has begun; sweeps and other paints come in it.
    for (int i = 0; i < 5; ++i) {
        form().Graph3D.noteChange();
        flush();
        canvas().repaint();
    }
    EXPECT_EQ(canvas().drawings(), before);
    EXPECT_TRUE(QTest::qWaitFor([&] { return canvas().drawings() == before + 1; }));
}

TEST_F(WaterfallWindowTest, PictureThatRests_IsDrawnOnceMoreAndFiner) {
    open(100);
    const QImage coarse = canvas().grab().toImage();
    const int before = canvas().drawings();
    canvas().setStillAfter(30);
    form().Graph3D.noteChange();
    flush();
    EXPECT_TRUE(QTest::qWaitFor([&] { return canvas().drawings() == before + 2; }));
    EXPECT_NE(canvas().grab().toImage(), coarse);
    EXPECT_TRUE(savePicture(waterfall(), "waterfall-still"));
    QTest::qWait(100);
    EXPECT_EQ(canvas().drawings(), before + 2);
    // The next change is drawn fast again.
    canvas().setStillAfter(kNever);
    form().Graph3D.noteChange();
    flush();
    EXPECT_EQ(canvas().grab().toImage(), coarse);
}

TEST_F(WaterfallWindowTest, Window_OfTheSmallestSize_IsDrawn) {
    open(10);
    canvas().setMinimumSize(1, 1);
    canvas().resize(1, 1);
    canvas().grab();
    SUCCEED();
}

struct SpectrogramWidgetTest : WaterfallWindowTest {
    SpectrogramWidget& earlier() {
        return *static_cast<SpectrogramWidget*>(
            window->binder().widgetOf(panel().SpectrogramPicture));
    }
    void shown(int rows) {
        show();
        panel().SpectrogramShow.Click();
        flush();
        sweeps(rows);
        flush();
    }
};

TEST_F(SpectrogramWidgetTest, ItIsOffAtFirst_AndTheMenuShowsIt) {
    show();
    EXPECT_FALSE(earlier().isVisible());
    EXPECT_FALSE(panel().SpectrogramPause.Enabled);
    panel().SpectrogramShow.Click();
    flush();
    EXPECT_TRUE(earlier().isVisible());
    EXPECT_TRUE(panel().SpectrogramShow.Checked);
}

TEST_F(SpectrogramWidgetTest, Click_ShowsTheSweepUntilTheNextOne) {
    shown(40);
    QTest::mouseClick(&earlier(), Qt::LeftButton, {}, {200, 6 + 2 * 10});
    EXPECT_EQ(panel().CWGraph1.Note.get(), "SWEEP OF 12:00:15");
    sweeps(1);
    EXPECT_EQ(panel().CWGraph1.Note.get(), "");
}

TEST_F(SpectrogramWidgetTest, Keys_GoBackAndNewSweepsLeaveThePlace) {
    shown(150);
    QTest::keyClick(&earlier(), Qt::Key_Down);
    QTest::keyClick(&earlier(), Qt::Key_Down);
    EXPECT_EQ(earlier().scrolled(), 2);
    sweeps(5);
    EXPECT_EQ(earlier().scrolled(), 7);
    QTest::keyClick(&earlier(), Qt::Key_Home);
    EXPECT_EQ(earlier().scrolled(), 0);
    sweeps(5);
    EXPECT_EQ(earlier().scrolled(), 0);
    QTest::keyClick(&earlier(), Qt::Key_End);
    EXPECT_EQ(earlier().scrolled(), 159);
}

TEST_F(SpectrogramWidgetTest, Pause_KeepsThePictureWhileSweepsGoOn) {
    shown(20);
    panel().SpectrogramPause.Click();
    flush();
    sweeps(6);
    EXPECT_EQ(earlier().scrolled(), 6);
    panel().SpectrogramPause.Click();
    flush();
    EXPECT_EQ(earlier().scrolled(), 0);
}

}  // namespace
}  // namespace zel
