#pragma once

#include <functional>
#include <memory>
#include <string>

namespace favrin::platform {

class ViewController;

/** Makes controllers by their registered class name, so that one side can create another that it knows only by
 * messages. */
namespace viewcontrollerregistry {

using Factory = std::function<std::unique_ptr<ViewController>()>;

/** A second registration under a name replaces the first. Main thread only. */
void registerClass(const std::string &className, Factory factory);
/** None for a name that nobody registered. */
std::unique_ptr<ViewController> create(const std::string &className);

} // namespace viewcontrollerregistry

} // namespace favrin::platform
