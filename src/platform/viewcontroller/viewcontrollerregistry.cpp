#include "platform/viewcontroller/viewcontrollerregistry.h"

#include "platform/viewcontroller/viewcontroller.h"

#include <map>
#include <utility>

namespace favrin::platform::viewcontrollerregistry {

namespace {

std::map<std::string, Factory> &factories()
{
    static std::map<std::string, Factory> byName;
    return byName;
}

} // namespace

void registerClass(const std::string &className, Factory factory)
{
    factories().insert_or_assign(className, std::move(factory));
}

std::unique_ptr<ViewController> create(const std::string &className)
{
    const auto found = factories().find(className);
    if (found == factories().end() || !found->second)
        return nullptr;
    // A copy: the controller's construction may register further classes.
    const Factory factory = found->second;
    return factory();
}

} // namespace favrin::platform::viewcontrollerregistry
