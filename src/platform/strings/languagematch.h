#pragma once

#include <string>
#include <string_view>
#include <vector>

namespace favrin::platform {

/**
 * The language of @p supported that people who asked for @p desired read best, or an empty text when none comes near.
 * All are BCP 47 tags. Scripts and regions that go without saying count: "zh-TW" finds "zh-Hant", "pt" finds "pt-BR",
 * "no" finds "nb"; of languages that are equally near, the first. Any thread.
 */
std::string bestLanguage(std::string_view desired, const std::vector<std::string> &supported);

} // namespace favrin::platform
