#pragma once

// The loader is opened when a GPU is looked for, so that a process that shows none neither links nor loads it.
#define VULKAN_HPP_DISPATCH_LOADER_DYNAMIC 1
#define VULKAN_HPP_ENABLE_DYNAMIC_LOADER_TOOL 1
#include <vulkan/vulkan_raii.hpp>
