#pragma once

#include "favorites/favoritecolorpickercoordinator.h"
#include "favorites/favoritecolorpickermodel.h"
#include "favorites/favoritescollectionview.h"
#include "service/colorpickerstate.h"

#include <memory>

namespace favrin::favorites {

/**
 * The strip of suggested and favorite colors. It edits and reads the state, shares its pages through the model, and has
 * the keys; cells are in the collection view, which whoever arranges the strip lays into something that scrolls.
 *
 * Horizontal positions are those of the scrolled content, mirrored where the writing direction is.
 */
class FavoriteColorPickerView : public QQuickItem
{
    Q_OBJECT
    QML_NAMED_ELEMENT(FavoriteColorPickerBridge)
    Q_PROPERTY(favrin::service::ColorPickerState *colorPickerState READ colorPickerState WRITE setColorPickerState
                   NOTIFY colorPickerStateChanged REQUIRED FINAL)
    Q_PROPERTY(
        favrin::favorites::FavoriteColorPickerModel *model READ model WRITE setModel NOTIFY modelChanged REQUIRED FINAL)
    Q_PROPERTY(
        int swatchesPerPage READ swatchesPerPage WRITE setSwatchesPerPage NOTIFY swatchesPerPageChanged REQUIRED FINAL)
    Q_PROPERTY(favrin::favorites::FavoritesCollectionView *collectionView READ collectionView WRITE setCollectionView
                   NOTIFY collectionViewChanged FINAL)
    Q_PROPERTY(double contentWidth READ contentWidth NOTIFY contentWidthChanged FINAL)
    Q_PROPERTY(double pageWidth READ pageWidth NOTIFY contentWidthChanged FINAL)
    Q_PROPERTY(double edgeReach READ edgeReach CONSTANT FINAL)
    Q_PROPERTY(QRectF focusFrame READ focusFrame NOTIFY focusFrameChanged FINAL)
    Q_PROPERTY(bool focusVisible READ focusVisible NOTIFY focusFrameChanged FINAL)

public:
    using Model = FavoriteColorPickerModel;
    using Coordinator = FavoriteColorPickerCoordinator;

    explicit FavoriteColorPickerView(QQuickItem *parent = nullptr);
    ~FavoriteColorPickerView() override;

    service::ColorPickerState *colorPickerState() const { return m_state; }
    void setColorPickerState(service::ColorPickerState *state);
    Model *model() const { return m_model; }
    void setModel(Model *model);
    int swatchesPerPage() const { return m_swatchesPerPage; }
    void setSwatchesPerPage(int swatchesPerPage);
    FavoritesCollectionView *collectionView() const { return m_coordinator->collectionView(); }
    void setCollectionView(FavoritesCollectionView *collectionView);
    DeletedIndexes &deletedIndexes() { return m_deletedIndexes; }

    /** Of the scrolled content, and of the page that is seen of it. */
    double contentWidth() const;
    double pageWidth() const;
    double edgeReach() const { return favorites::edgeReach; }
    /** The item that the keyboard is at, and whether the user is using it. */
    QRectF focusFrame() const;
    bool focusVisible() const { return m_focusVisible && m_focusedItem.isValid(); }

    /** To be told where the content is scrolled to. */
    Q_INVOKABLE void didScroll(double contentX);
    Q_INVOKABLE void movementStarted();
    /** Where a movement rests that ends at @p velocity, in points per second as the content's position changes. */
    Q_INVOKABLE double restingPosition(double velocity) const;
    Q_INVOKABLE void tap(QPointF point);
    Q_INVOKABLE void showDeleteCallout(QPointF point);
    /** The command of the delete menu that was asked for last. */
    Q_INVOKABLE void performDelete();

    // For the coordinator and for assistive technologies.
    Coordinator &coordinator() { return *m_coordinator; }
    const Coordinator &coordinator() const { return *m_coordinator; }
    /** Whether something is on screen that a change could disturb. */
    bool isShown() const;
    void scrollTo(double offset, Animation animation);
    /** The list or its layout is another one. */
    void contentChanged();
    std::optional<int> focusedPlace() const;

Q_SIGNALS:
    void colorPickerStateChanged();
    void modelChanged();
    void swatchesPerPageChanged();
    void collectionViewChanged();
    void contentWidthChanged();
    void focusFrameChanged();
    void scrollRequested(double contentX, bool animated);
    /** A menu with the delete command is wanted, pointing at @p cell, in the collection view's coordinates. */
    void deleteCalloutRequested(QRectF cell);

protected:
    void componentComplete() override;
    void keyPressEvent(QKeyEvent *event) override;
    void focusInEvent(QFocusEvent *event) override;
    void focusOutEvent(QFocusEvent *event) override;

private:
    void setNeedsUpdate();
    void updateNow();
    void updateDirection();
    /** From an offset in reading direction to a position of the content, and back. */
    double mirroredIfNeeded(double offset) const;
    int shownPage() const;
    std::optional<int> placeForKeys();
    void setFocusedPlace(int place);
    void moveFocus(int place);
    void keepFocus();
    void setFocusVisible(bool visible);
    bool handleCommandKey(const QKeyEvent &event, int place);
    bool presentDeleteCallout(int place);

    QPointer<service::ColorPickerState> m_state;
    QPointer<Model> m_model;
    int m_swatchesPerPage = 2;
    DeletedIndexes m_deletedIndexes;
    std::unique_ptr<Coordinator> m_coordinator;
    bool m_updateIsPending = false;
    int m_movementStartPage = 0;
    /** Where an animated scroll goes that has not arrived. */
    std::optional<double> m_scrollTarget;
    /** The content is being adjusted: what is heard of scrolling meanwhile is no scrolling. */
    bool m_isAdjusting = false;
    QPersistentModelIndex m_focusedItem;
    /** Where it was last, for the time when it is gone. */
    int m_focusedPlace = 0;
    bool m_focusVisible = false;
    QPointer<FavoriteColorWellCell> m_calloutCell;
};

} // namespace favrin::favorites
