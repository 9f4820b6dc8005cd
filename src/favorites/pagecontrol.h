#pragma once

#include "favorites/favoritecolorpickermodel.h"
#include "platform/shapes/crisppainteditem.h"

#include <QPointer>
#include <QtQmlIntegration/qqmlintegration.h>

namespace favrin::favorites {

/**
 * The page indicator: a row of dots, the current page's stressed; hidden when there is but one page. It follows the
 * model, and asks the model for another page when the user taps or drags it.
 *
 * To assistive technologies it is a value: the number of the page, from 1 on.
 */
class PageControl : public favrin::platform::CrispPaintedItem
{
    Q_OBJECT
    QML_NAMED_ELEMENT(PageControlBridge)
    Q_PROPERTY(favrin::favorites::FavoriteColorPickerModel *favoriteColorPickerModel READ favoriteColorPickerModel WRITE
                   setFavoriteColorPickerModel NOTIFY favoriteColorPickerModelChanged REQUIRED FINAL)
    Q_PROPERTY(int value READ value WRITE setValue NOTIFY pageChanged FINAL)
    Q_PROPERTY(int minimumValue READ minimumValue CONSTANT FINAL)
    Q_PROPERTY(int maximumValue READ maximumValue NOTIFY pageChanged FINAL)

public:
    explicit PageControl(QQuickItem *parent = nullptr);

    FavoriteColorPickerModel *favoriteColorPickerModel() const { return m_model; }
    void setFavoriteColorPickerModel(FavoriteColorPickerModel *model);

    int numberOfPages() const { return m_numberOfPages; }
    int currentPage() const { return m_currentPage; }

    int value() const { return m_currentPage + 1; }
    void setValue(int value);
    int minimumValue() const { return 1; }
    int maximumValue() const { return m_numberOfPages; }

    /** A tap at a point of the row. */
    Q_INVOKABLE void tap(double x);
    Q_INVOKABLE void beginDrag();
    /** @param translation how far the drag has gone since it began */
    Q_INVOKABLE void drag(double translation);

Q_SIGNALS:
    void favoriteColorPickerModelChanged();
    void pageChanged();

protected:
    void paint(QPainter &painter, QSize size, double devicePixelRatio) override;

private:
    void followModel();
    void show(int numberOfPages, int currentPage);
    /** The user's choice. */
    void selectPage(int page);

    QPointer<FavoriteColorPickerModel> m_model;
    int m_numberOfPages = 1;
    int m_currentPage = 0;
    int m_dragStartPage = 0;
};

} // namespace favrin::favorites
