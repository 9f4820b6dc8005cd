#pragma once

#include "roadhost.h"

#include <QClipboard>
#include <QFontMetricsF>
#include <QGuiApplication>

#include <cmath>

/** A host with a narrow window and what stands where in the sliders tab, which does not scroll there. */
class SlidersHost : public RoadHost
{
public:
    enum Row { Red, Green, Blue, Opacity };

    SlidersHost() : RoadHost(windowSize) {}

    QPoint onTrack(Row row, double value) const
    {
        return placeAt(height / 2 + value * (trackWidth() - height), middle(row));
    }
    QPoint field(Row row) const { return placeAt(tabArea().width() - fieldWidth / 2, middle(row)); }
    QPoint hexField() const { return placeAt(tabArea().width() - hexWidth / 2, hexMiddle()); }
    QPoint colorSpaceButton() const { return placeAt(tabArea().width() - hexWidth - 60, hexMiddle()); }
    /** A row of the menu below the button. */
    QPoint colorSpace(int index) const
    {
        return colorSpaceButton() + QPoint(0, static_cast<int>(height / 2 + menuRow * (index + 1.5)));
    }

    void press(Qt::Key key, Qt::KeyboardModifiers modifiers = {}) { QTest::keyClick(&window, key, modifiers); }
    void type(const QString &characters)
    {
        for (const QChar character : characters)
            QTest::keyClick(&window, character.toLatin1());
    }
    /** The field has the keyboard, and all its text is selected. */
    void select(QPoint field)
    {
        // Not where the last click was: both would be a double click.
        m_besideMiddle = -m_besideMiddle;
        click(field + QPoint(m_besideMiddle, 0));
        press(Qt::Key_A, Qt::ControlModifier);
    }
    /** What stands in a field, as the user would copy it. All that was reported before has arrived then. */
    QString text(QPoint field)
    {
        auto *clipboard = QGuiApplication::clipboard();
        clipboard->clear();
        select(field);
        press(Qt::Key_C, Qt::ControlModifier);
        const bool isCopied = QTest::qWaitFor([clipboard] { return !clipboard->text().isEmpty(); });
        return isCopied ? clipboard->text() : QStringLiteral("(nothing)");
    }

private:
    static constexpr QSize windowSize = QSize(420, 900);
    static constexpr double height = 36;
    static constexpr double fieldGap = 16;
    static constexpr double fieldWidth = 76;
    static constexpr double hexWidth = 100;
    static constexpr double menuRow = 40;

    double trackWidth() const { return tabArea().width() - fieldGap - fieldWidth; }
    static double titleHeight()
    {
        QFont footnote = QGuiApplication::font();
        footnote.setPixelSize(13);
        return std::ceil(QFontMetricsF(footnote).height()) + 5;
    }
    double middle(Row row) const
    {
        const double first = titleHeight() + height / 2;
        return row == Opacity ? footerArea().top() - tabArea().top() + first
                              : first + static_cast<int>(row) * (titleHeight() + height + 18);
    }
    double hexMiddle() const { return 3 * (titleHeight() + height) + 2 * 18 + 25 + height / 2; }
    QPoint placeAt(double x, double y) const { return inTab(x / tabArea().width(), y / tabArea().height()); }

    int m_besideMiddle = 12;
};
