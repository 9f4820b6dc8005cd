#include "pickerwindow.h"

#include "favorites/pagecontrol.h"
#include "sliders/cpslider.h"

using namespace favrin;
using service::Tab;

namespace {

std::vector<model::SomeColor> grays(int count)
{
    std::vector<model::SomeColor> colors;
    for (int level = 0; level < count; ++level)
        colors.emplace_back(level / 255.0, 0.0, 0.0, 1.0, model::SomeColor::ColorSpace::sRGB);
    return colors;
}

enum class Layout { Portrait, Landscape };
enum class Opacity { Hidden, Shown };

} // namespace

/** Where everything lies, from the top edge to the bottom padding. */
class PickerLayoutTest : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void cleanup()
    {
        theme::Theme::instance().setLayoutDirection(Qt::LeftToRight);
        theme::Theme::instance().setTextSizeCategory(theme::TextSizeCategory::Large);
    }

    void framesAreAsDesigned_data()
    {
        QTest::addColumn<int>("width");
        QTest::addColumn<Layout>("layout");
        QTest::addColumn<Opacity>("opacity");
        QTest::addColumn<int>("favorites");
        QTest::addColumn<int>("swatchesPerPage");
        QTest::addColumn<double>("inset");
        const auto row = [](int width, Layout layout, Opacity opacity, int favorites, int swatches, double inset) {
            QTest::addRow("%d %s%s, %d favorites", width, layout == Layout::Landscape ? "landscape" : "portrait",
                          opacity == Opacity::Shown ? " with opacity" : "", favorites)
                << width << layout << opacity << favorites << swatches << inset;
        };
        row(320, Layout::Portrait, Opacity::Shown, 5, 8, (194.0 - 174.0) / 2);
        row(320, Layout::Portrait, Opacity::Hidden, 30, 8, (194.0 - 174.0) / 2);
        row(360, Layout::Portrait, Opacity::Shown, 0, 10, (234.0 - 222.0) / 2);
        row(360, Layout::Portrait, Opacity::Hidden, 30, 10, (234.0 - 222.0) / 2);
        row(420, Layout::Portrait, Opacity::Shown, 12, 12, (294.0 - 270.0) / 2);
        row(568, Layout::Portrait, Opacity::Shown, 5, 16, (442.0 - 366.0) / 2);
        row(568, Layout::Landscape, Opacity::Shown, 5, 8, (163.0 - 160.0) / 2);
        row(568, Layout::Landscape, Opacity::Hidden, 30, 8, (163.0 - 160.0) / 2);
        row(1024, Layout::Portrait, Opacity::Shown, 40, 16, (898.0 - 366.0) / 2);
        row(1024, Layout::Landscape, Opacity::Shown, 5, 16, (391.0 - 336.0) / 2);
        row(100, Layout::Portrait, Opacity::Shown, 1, 2, 10.0);
    }

    void framesAreAsDesigned()
    {
        QFETCH(int, width);
        QFETCH(Layout, layout);
        QFETCH(Opacity, opacity);
        QFETCH(int, favorites);
        QFETCH(int, swatchesPerPage);
        const bool landscape = layout == Layout::Landscape;
        const double padding = landscape ? 20.0 : 16.0;
        const double wellSide = landscape ? 72.0 : 78.0;

        PickerWindow picker(QSize(width, 1400), grays(favorites), [&](service::ColorPickerState &state) {
            state.useLandscapeLayout.set(landscape);
            state.showsAlpha.set(opacity == Opacity::Shown);
            // The button that adds takes a place.
            state.selectedColor.set(grays(1).front());
        });
        QVERIFY(picker.view);
        // The host makes room for the picker before its first frame.
        const double wanted = picker.view->implicitHeight();
        QVERIFY(picker.isReady());

        const QRectF tabPicker = PickerWindow::inWindow(picker.item(QStringLiteral("Color Picker Type")));
        QCOMPARE(tabPicker, QRectF(padding, 55.0, width - 2 * padding, 32.0));
        const double tabWidth = landscape ? (tabPicker.width() - 18.0) / 2 : tabPicker.width();
        const QRectF tab(padding, tabPicker.bottom() + (landscape ? 16.0 : 20.0), tabWidth, tabWidth / 1.2);
        QCOMPARE(PickerWindow::inWindow(picker.grid()), tab);

        const QPointF footer =
            landscape ? QPointF(tab.right() + 18.0, tab.top()) : QPointF(tab.left(), tab.bottom() + 18.0);
        const auto *opacitySlider = picker.itemOf<sliders::CPSlider>();
        QCOMPARE(opacitySlider->isVisible(), opacity == Opacity::Shown);
        const QRectF track = PickerWindow::inWindow(opacitySlider);
        const double wellTop = opacity == Opacity::Shown ? track.bottom() + 22.0 + 1.0 + 22.0 : footer.y();
        if (opacity == Opacity::Shown) {
            QCOMPARE(track.left(), footer.x());
            QCOMPARE(track.height(), 36.0);
            QCOMPARE(track.width(), tabWidth - 16.0 - (landscape ? 70.0 : 76.0));
        }
        const QRectF well = PickerWindow::inWindow(picker.itemOf<shell::ColorWell>());
        QCOMPARE(well, QRectF(footer.x(), wellTop, wellSide, wellSide));

        const auto *strip = picker.itemOf<favorites::FavoriteColorPickerView>();
        const QRectF favoritesArea(well.right() + (landscape ? 20.0 : 16.0), wellTop,
                                   tabWidth - wellSide - (landscape ? 20.0 : 16.0), wellSide);
        QCOMPARE(strip->swatchesPerPage(), swatchesPerPage);
        QFETCH(double, inset);
        QCOMPARE(PickerWindow::inWindow(strip).topLeft(), favoritesArea.topLeft() + QPointF(inset, 0.0));
        QCOMPARE(strip->height(), wellSide);

        const auto *pageControl = picker.itemOf<favorites::PageControl>();
        const bool severalPages = favorites + 1 > swatchesPerPage;
        QCOMPARE(pageControl->isVisible(), severalPages);
        if (severalPages)
            QCOMPARE(PickerWindow::inWindow(pageControl).left(), favoritesArea.left());
        const double footerBottom = severalPages ? PickerWindow::inWindow(pageControl).bottom() + 5.0
                                                 : well.bottom() + (landscape ? 20.0 : 16.0);
        QCOMPARE(picker.view->implicitWidth(), static_cast<double>(width));
        QCOMPARE(picker.view->implicitHeight(), landscape ? std::max(footerBottom, tab.bottom() + 20.0) : footerBottom);
        // Nothing was added after the first update: neither room nor a page control that comes and goes.
        QCOMPARE(picker.view->implicitHeight(), wanted);
    }

    void titleStaysWhereButtonsAreHidden()
    {
        PickerWindow picker;
        QVERIFY(picker.isReady());
        const auto title = [&] { return PickerWindow::inWindow(picker.item(QStringLiteral("Colors"))); };
        const QRectF before = title();
        const QQuickItem *eyedropperButton = picker.item(QStringLiteral("Eyedropper_Accessibility"));
        const QRectF eyedropper = PickerWindow::inWindow(eyedropperButton);
        const QQuickItem *closeButton = picker.item(QStringLiteral("Close"));
        const QRectF close = PickerWindow::inWindow(closeButton);
        QCOMPARE(eyedropper.left(), 16.0);
        QCOMPARE(close.right(), 344.0);
        // The same room on either side of the title.
        QVERIFY(std::abs((before.left() - eyedropper.right()) - (close.left() - before.right())) <= 1.0);
        picker.state.showsEyedropper.set(false);
        for (auto *hides : {&picker.state.isEmbedded, &picker.state.isPopover}) {
            hides->set(true);
            QCOMPARE(title(), before);
            for (const QRectF &button : {eyedropper, close})
                QTest::mouseClick(&picker.window, Qt::LeftButton, {}, button.center().toPoint());
            QVERIFY(!picker.state.eyedropperShowing());
            QCOMPARE(picker.closed, 0);
            QVERIFY(!closeButton->hasActiveFocus() && closeButton->opacity() == 0.0);
            QVERIFY(!closeButton->activeFocusOnTab() && !eyedropperButton->activeFocusOnTab());
            hides->set(false);
        }
    }

    void slidersTakeTheAreaOfTheOtherTabs_data()
    {
        QTest::addColumn<QSize>("size");
        QTest::addColumn<bool>("landscape");
        QTest::addColumn<bool>("fits");
        QTest::newRow("portrait") << QSize(360, 700) << false << true;
        QTest::newRow("narrow") << QSize(320, 700) << false << false;
        QTest::newRow("landscape") << QSize(568, 320) << true << false;
    }

    void slidersTakeTheAreaOfTheOtherTabs()
    {
        QFETCH(QSize, size);
        QFETCH(bool, landscape);
        QFETCH(bool, fits);
        PickerWindow picker(size);
        picker.state.useLandscapeLayout.set(landscape);
        QVERIFY(picker.isReady());
        const double heightBefore = picker.view->implicitHeight();
        const QRectF area = PickerWindow::inWindow(picker.grid());
        picker.state.selectedTab.set(Tab::sliders);
        QQuickItem *hex = picker.item(QStringLiteral("sRGB Hex Color #"));
        QVERIFY(hex);
        QCOMPARE(PickerWindow::inWindow(picker.item(QStringLiteral("Red"))).left(), area.left());
        const double bottom = PickerWindow::inWindow(hex).bottom();
        // What is less than half of the space below needs no more room.
        QCOMPARE(bottom <= area.bottom() + 9.0, fits);
        // Where it does not fit nothing lies over it, and all of it can be scrolled to.
        QCOMPARE(picker.view->implicitHeight() == heightBefore, fits);
        QVERIFY(bottom <= picker.view->implicitHeight());
        if (!landscape)
            QVERIFY(bottom <= PickerWindow::inWindow(picker.itemOf<shell::ColorWell>()).top());
    }

    void nothingIsLostWhenTheHostTurns()
    {
        PickerWindow picker(QSize(360, 640), grays(30));
        QVERIFY(picker.isReady());
        picker.state.selectedTab.set(Tab::sliders);
        picker.state.selectedColor.set(model::SomeColor(0.1, 0.2, 0.3, 0.4, model::SomeColor::ColorSpace::displayP3));
        const auto color = picker.state.selectedColor();
        const QRectF before = PickerWindow::inWindow(picker.itemOf<shell::ColorWell>());
        for (const bool landscape : {true, false}) {
            picker.state.useLandscapeLayout.set(landscape);
            picker.state.size.set(landscape ? QSizeF(568.0, 320.0) : QSizeF(360.0, 640.0));
            picker.view->setSize(picker.state.size());
            QCOMPARE(picker.state.selectedTab(), Tab::sliders);
            QCOMPARE(picker.state.selectedColor(), color);
        }
        QCOMPARE(PickerWindow::inWindow(picker.itemOf<shell::ColorWell>()), before);
    }

    void focusedFieldStaysAboveTheKeyboard()
    {
        PickerWindow picker;
        QVERIFY(picker.isReady());
        picker.state.selectedTab.set(Tab::sliders);
        QQuickItem *hex = picker.editableItem(QStringLiteral("sRGB Hex Color #"));
        QVERIFY(hex);
        QTest::mouseClick(&picker.window, Qt::LeftButton, {}, PickerWindow::inWindow(hex).center().toPoint());
        QVERIFY(hex->hasActiveFocus());
        const QRectF before = PickerWindow::inWindow(hex);
        picker.view->setHeight(300.0);
        const QRectF field = PickerWindow::inWindow(hex);
        QVERIFY(field.top() < before.top());
        QVERIFY(field.bottom() + 44.0 <= 300.0);
        QVERIFY(field.top() >= 0.0);
    }

    void touchAreasAreLargeEnough()
    {
        PickerWindow picker;
        QVERIFY(picker.isReady());
        picker.state.selectedTab.set(Tab::sliders);
        for (const char *name :
             {"Eyedropper_Accessibility", "Close", "Spectrum", "Red", "Opacity", "sRGB Hex Color #"}) {
            const QQuickItem *item = picker.item(QString::fromLatin1(name));
            const double reach = std::max(0.0, 44.0 - item->height()) / 2;
            for (const double y : {-reach + 0.5, item->height() + reach - 0.5})
                QVERIFY2(item->contains(QPointF(item->width() / 2, y)), name);
        }
    }
};

QTEST_MAIN(PickerLayoutTest)
#include "tst_pickerlayout.moc"
