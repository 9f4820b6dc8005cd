#pragma once

#include "../support/sceneitems.h"
#include "service/colorpickerstate.h"
#include "sliders/cpslider.h"
#include "theme/theme.h"

#include <QQmlComponent>
#include <QQmlEngine>
#include <QQuickItem>
#include <QQuickWindow>
#include <QTest>

#include <algorithm>
#include <memory>

/**
 * The content of the sliders tab and, below it, the row of the opacity, in a window of 344 × 400 points that is shown
 * and active. The track of a row is 236 points wide and begins at 8.
 */
class SlidersWindow
{
public:
    using SomeColor = favrin::model::SomeColor;

    SlidersWindow()
    {
        state.fallbackColor.set({0.0, 0.0, 0.0, 1.0, SomeColor::ColorSpace::sRGB});
        state.selectedColor.set(SomeColor(0.0, 97 / 255.0, 253 / 255.0, 1.0, SomeColor::ColorSpace::sRGB));
        engine.addImportPath(QStringLiteral("qrc:/qt/qml"));
        QQmlComponent component(&engine);
        component.setData(R"(
            import QtQuick
            import Favrin.Service
            import Favrin.Sliders
            import Favrin.Theme
            Item {
                id: root
                required property ColorPickerState colorPickerState
                width: 344
                height: 400
                LayoutMirroring.enabled: Theme.isMirrored
                LayoutMirroring.childrenInherit: true
                RGBAView { id: sliders; x: 8; width: 328; colorPickerState: root.colorPickerState }
                ColorSlider {
                    x: 8; y: 300; width: 328
                    colorPickerState: root.colorPickerState
                    component: ColorComponent.Opacity
                }
            }
        )",
                          QUrl());
        const QVariantMap properties = {{QStringLiteral("colorPickerState"), QVariant::fromValue(&state)}};
        view.reset(qobject_cast<QQuickItem *>(component.createWithInitialProperties(properties)));
        QVERIFY2(view, qPrintable(component.errorString()));
        view->setParentItem(window.contentItem());
        window.resize(344, 400);
        window.show();
        window.requestActivate();
        QVERIFY(QTest::qWaitForWindowActive(&window));
    }

    void click(const QQuickItem *item, double x) { QTest::mouseClick(&window, Qt::LeftButton, {}, at(item, x)); }
    void click(const QQuickItem *item) { click(item, item->width() / 2.0); }

    favrin::sliders::CPSlider *slider(favrin::sliders::ColorComponent::Name component) const
    {
        for (auto *slider : view->findChildren<favrin::sliders::CPSlider *>()) {
            if (slider->component() == component)
                return slider;
        }
        return nullptr;
    }

    /** The text inputs: red, green, blue, hex, opacity. */
    QQuickItem *input(int index) const
    {
        QList<QQuickItem *> inputs;
        for (auto *item : view->findChildren<QQuickItem *>()) {
            if (item->inherits("QQuickTextInput"))
                inputs << item;
        }
        std::sort(inputs.begin(), inputs.end(), [](const QQuickItem *left, const QQuickItem *right) {
            return left->mapToScene(QPointF()).y() < right->mapToScene(QPointF()).y();
        });
        return inputs.value(index);
    }

    SomeColor color() const { return state.selectedColor().value(); }

    /** A point on the middle of the slider, @p x from its left edge, in the window. */
    static QPoint at(const QQuickItem *item, double x)
    {
        return item->mapToScene(QPointF(x, item->height() / 2.0)).toPoint();
    }

    favrin::service::ColorPickerState state = favrin::service::ColorPickerState({});
    QQmlEngine engine;
    QQuickWindow window;
    std::unique_ptr<QQuickItem> view;
};
