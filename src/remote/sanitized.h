#pragma once

#include "remote/records.h"

/**
 * Records as they may be used, whatever the other side sent. Both ends apply it: the host before it sends, the service
 * to what it received. Pure functions, any thread; a sane record comes back unchanged.
 *
 * | Field | Becomes |
 * |---|---|
 * | an enum with a number that it does not hold | the default of the record |
 * | display identifier, locale: not UTF-8, or over limits::textBytes | empty |
 * | title: not UTF-8 | none, hence the default title |
 * | title over limits::titleBytes | cut at a character |
 * | suggested color with a number that is not finite | left out |
 * | suggested colors past limits::suggestedColors | cut |
 * | width, height, keyboard space: negative or not a number | 0 |
 * | the same, over limits::largestSize or infinite | limits::largestSize |
 * | grid style | unchanged: every number has a meaning |
 */
namespace favrin::remote {

Traits sanitized(Traits traits);
Configuration sanitized(Configuration configuration);

} // namespace favrin::remote
