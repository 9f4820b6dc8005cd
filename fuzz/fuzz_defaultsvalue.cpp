#include "fuzzinput.h"
#include "platform/defaults/valuecoding.h"

using namespace favrin::platform;

int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size)
{
    FuzzInput input(data, size);
    const int type = input.number<std::int8_t>();
    const auto bytes = input.rest();
    const auto value = decode(type, {reinterpret_cast<const unsigned char *>(bytes.data()), bytes.size()});
    if (!value)
        return 0;
    const auto encoded = encode(*value);
    require(encoded && encoded->type == type, "what was read can be written");
    require(std::string(encoded->bytes.begin(), encoded->bytes.end()) == bytes, "there is one way to write a value");
    return 0;
}
