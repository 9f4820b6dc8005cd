#pragma once

#include <vector>

/** The dots of a page indicator: plain functions. Lengths in points. */
namespace favrin::favorites {

/** One dot, for one page. */
struct PageDot
{
    int page = 0;
    double center = 0.0;
    /** 1 in general; less at an end of the row beyond which there are more pages. */
    double scale = 1.0;

    bool operator==(const PageDot &) const = default;
};

inline constexpr double pageDotDiameter = 7.0;

/**
 * The dots that fit a row of @p width, in reading direction: one per page, or those around the current page where there
 * are more pages than room.
 */
std::vector<PageDot> pageDots(int numberOfPages, int currentPage, double width);

/** The page of the dot nearest to @p position; the current one where there are no dots. */
int pageAtPosition(double position, int numberOfPages, int currentPage, double width);

/**
 * The page that a drag along the row leads to: one page per dot, or as many as make the row's length lead through all.
 * @param distance how far the drag went
 */
int pageAfterDrag(double distance, int startPage, int numberOfPages, double width);

} // namespace favrin::favorites
