#pragma once

#include "platform/observation/published.h"

#include <QObject>
#include <QtQmlIntegration/qqmlintegration.h>

#include <optional>

namespace favrin::favorites {

/** What the strip and its page indicator share: how many pages there are and which one is shown. Main thread only. */
class FavoriteColorPickerModel : public QObject, public platform::ObservableObject
{
    Q_OBJECT
    QML_ELEMENT
    Q_PROPERTY(int numberOfPages READ readNumberOfPages NOTIFY numberOfPagesChanged FINAL)
    Q_PROPERTY(int currentPage READ readCurrentPage NOTIFY currentPageChanged FINAL)

public:
    explicit FavoriteColorPickerModel(QObject *parent = nullptr);

    platform::Published<int> numberOfPages;
    platform::Published<int> currentPage;
    /** The page that the indicator asks for, until the strip has scrolled there. */
    platform::Published<std::optional<int>> pageControlPendingPage;

    int readNumberOfPages() const { return numberOfPages(); }
    int readCurrentPage() const { return currentPage(); }

Q_SIGNALS:
    // Each is emitted after the value is stored.
    void numberOfPagesChanged();
    void currentPageChanged();
    void pageControlPendingPageChanged();
};

} // namespace favrin::favorites
