#include "favorites/pagedots.h"

#include <algorithm>
#include <cmath>

namespace favrin::favorites {
namespace {

constexpr double pitch = 16.0;
constexpr double mostDots = 11.0;
/** Of the dots at an end beyond which there are more pages, from the outermost inwards. */
constexpr double endScales[] = {0.45, 0.7};

int dotsThatFit(double width)
{
    return std::max(static_cast<int>(std::min(width / pitch, mostDots)), 1);
}

/** @param fromEnd how many dots stand between this one and an end, beyond which there are @p more pages */
double endScale(int fromEnd, int more)
{
    const int shrunk = std::min(more, 2);
    return fromEnd < shrunk ? endScales[fromEnd + 2 - shrunk] : 1.0;
}

} // namespace

std::vector<PageDot> pageDots(int numberOfPages, int currentPage, double width)
{
    const int count = std::min(dotsThatFit(width), std::max(numberOfPages, 0));
    const int first = std::clamp(currentPage - count / 2, 0, std::max(numberOfPages - count, 0));
    const double start = width / 2.0 - (count - 1) * pitch / 2.0;
    std::vector<PageDot> dots;
    for (int dot = 0; dot < count; ++dot) {
        const int page = first + dot;
        const double scale = std::min(endScale(dot, first), endScale(count - 1 - dot, numberOfPages - first - count));
        dots.push_back({page, start + dot * pitch, page == currentPage ? 1.0 : scale});
    }
    return dots;
}

int pageAtPosition(double position, int numberOfPages, int currentPage, double width)
{
    const auto dots = pageDots(numberOfPages, currentPage, width);
    const auto nearest =
        std::ranges::min_element(dots, {}, [position](const PageDot &dot) { return std::abs(dot.center - position); });
    return nearest != dots.end() ? nearest->page : currentPage;
}

int pageAfterDrag(double distance, int startPage, int numberOfPages, double width)
{
    const double pagesPerDot = std::max(1.0, static_cast<double>(numberOfPages) / dotsThatFit(width));
    const double page = startPage + std::round(distance / pitch * pagesPerDot);
    return static_cast<int>(std::clamp(page, 0.0, std::max(numberOfPages - 1.0, 0.0)));
}

} // namespace favrin::favorites
