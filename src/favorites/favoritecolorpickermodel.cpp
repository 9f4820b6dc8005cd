#include "favorites/favoritecolorpickermodel.h"

namespace favrin::favorites {

FavoriteColorPickerModel::FavoriteColorPickerModel(QObject *parent)
    : QObject(parent), numberOfPages(*this, 2), currentPage(*this, 0), pageControlPendingPage(*this, std::nullopt)
{
    numberOfPages.onStored([this] { Q_EMIT numberOfPagesChanged(); });
    currentPage.onStored([this] { Q_EMIT currentPageChanged(); });
    pageControlPendingPage.onStored([this] { Q_EMIT pageControlPendingPageChanged(); });
}

} // namespace favrin::favorites
