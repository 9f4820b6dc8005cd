#pragma once

#include "favorites/favoritecolorpickerview.h"
#include "favorites/pagecontrol.h"
#include "service/colorpickerstate.h"
#include "theme/theme.h"

#include <QPointingDevice>
#include <QQmlComponent>
#include <QQmlEngine>
#include <QQuickWindow>
#include <QTest>

using favrin::model::SomeColor;

inline SomeColor gray(int level, double alpha = 1.0)
{
    const double component = level / 255.0;
    return {component, component, component, alpha, SomeColor::ColorSpace::sRGB};
}

/** Colors that differ, as many as wanted. */
inline std::vector<SomeColor> differentColors(int count)
{
    std::vector<SomeColor> colors;
    for (int index = 0; index < count; ++index)
        colors.emplace_back((index * 37 % 256) / 255.0, (index / 256 % 256) / 255.0, (index * 91 % 256) / 255.0, 1.0,
                            SomeColor::ColorSpace::sRGB);
    return colors;
}

/** A strip and its page control in a window of 300 points: pages of 12 swatches, 6 to a row, from (15, 100) on. */
class FavoritesWindow
{
public:
    explicit FavoritesWindow(int favorites = 5, int windowWidth = 300) : state(differentColors(favorites))
    {
        state.fallbackColor.set(gray(0));
        engine.addImportPath(QStringLiteral("qrc:/qt/qml"));
        QQmlComponent component(&engine);
        component.setData(R"(
            import QtQuick
            import Favrin.Favorites
            import Favrin.Service
            import Favrin.Theme

            Rectangle {
                id: root

                required property ColorPickerState colorPickerState
                property alias model: model

                color: Theme.systemBackground
                LayoutMirroring.enabled: Theme.isMirrored
                LayoutMirroring.childrenInherit: true

                FavoriteColorPickerModel { id: model }
                StripFitting {
                    id: fitting
                    availableWidth: root.width - 20
                    useLandscapeLayout: root.colorPickerState.useLandscapeLayout
                }
                FavoriteColorPickerView {
                    objectName: "strip"
                    x: 10 + fitting.inset
                    y: 100
                    width: fitting.availableWidth - 2 * fitting.inset
                    height: fitting.stripHeight
                    colorPickerState: root.colorPickerState
                    model: model
                    swatchesPerPage: fitting.swatchesPerPage
                    Accessible.role: Accessible.List
                }
                PageControl {
                    objectName: "pageControl"
                    x: 10
                    y: 180
                    width: root.width - 20
                    height: implicitHeight
                    favoriteColorPickerModel: model
                }
            })",
                          QUrl());
        root.reset(qobject_cast<QQuickItem *>(
            component.createWithInitialProperties({{QStringLiteral("colorPickerState"), QVariant::fromValue(&state)},
                                                   {QStringLiteral("width"), windowWidth},
                                                   {QStringLiteral("height"), 220}})));
        if (!root) {
            qWarning("%s", qPrintable(component.errorString()));
            return;
        }
        root->setParentItem(window.contentItem());
        strip = root->findChild<favrin::favorites::FavoriteColorPickerView *>();
        pageControl = root->findChild<favrin::favorites::PageControl *>();
        model = root->property("model").value<favrin::favorites::FavoriteColorPickerModel *>();
        window.resize(windowWidth, 220);
    }

    bool show()
    {
        window.show();
        window.requestActivate();
        return strip && QTest::qWaitForWindowActive(&window);
    }

    favrin::favorites::FavoritesCollectionView &cells() const { return *strip->collectionView(); }
    const favrin::favorites::ItemList &items() const { return strip->coordinator().dataSource().items(); }
    int count() const { return static_cast<int>(items().size()); }
    int page() const { return model->currentPage(); }

    /** The middle of an item in the window, wherever the strip is scrolled to. */
    QPoint middle(int place) const { return cells().mapRectToScene(cells().frame(place)).center().toPoint(); }
    bool isSettled() const { return cells().transitionProgress() == 1.0; }

    favrin::service::ColorPickerState state;
    QQmlEngine engine;
    QQuickWindow window;
    std::unique_ptr<QQuickItem> root;
    favrin::favorites::FavoriteColorPickerView *strip = nullptr;
    favrin::favorites::PageControl *pageControl = nullptr;
    favrin::favorites::FavoriteColorPickerModel *model = nullptr;
};
