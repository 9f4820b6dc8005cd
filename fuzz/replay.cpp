#include "fuzzinput.h"

#include <filesystem>
#include <fstream>
#include <iterator>
#include <random>
#include <vector>

namespace {

using Bytes = std::vector<std::uint8_t>;

void run(const Bytes &bytes)
{
    // In memory of just this size, so that a sanitizer sees what lies beyond it.
    const Bytes exact(bytes);
    LLVMFuzzerTestOneInput(exact.data(), exact.size());
}

void mutate(Bytes &bytes, std::mt19937 &random)
{
    const auto place = [&] { return bytes.begin() + static_cast<std::ptrdiff_t>(random() % bytes.size()); };
    if (bytes.empty() || random() % 8 == 0)
        bytes.insert(bytes.empty() ? bytes.end() : place(), static_cast<std::uint8_t>(random()));
    else if (random() % 8 == 0)
        bytes.erase(place(), bytes.end());
    else
        *place() = static_cast<std::uint8_t>(random());
}

} // namespace

/** usage: replay FOLDER MUTATIONS    runs each file of the folder as it is, then mutations of them, always the same. */
int main(int argc, char *argv[])
{
    if (argc != 3)
        return 2;
    std::vector<std::filesystem::path> files;
    for (const auto &entry : std::filesystem::directory_iterator(argv[1]))
        files.push_back(entry.path());
    std::sort(files.begin(), files.end());
    std::vector<Bytes> corpus;
    for (const auto &path : files) {
        std::ifstream file(path, std::ios::binary);
        corpus.emplace_back(std::istreambuf_iterator<char>(file), std::istreambuf_iterator<char>());
        run(corpus.back());
    }
    if (corpus.empty())
        return 1;
    std::mt19937 random(1);
    const long mutations = std::strtol(argv[2], nullptr, 10);
    for (long round = 0; round < mutations; ++round) {
        Bytes bytes = corpus[random() % corpus.size()];
        for (auto hits = 1 + random() % 4; hits > 0; --hits)
            mutate(bytes, random);
        run(bytes);
    }
    std::printf("%zu inputs, %ld mutations\n", corpus.size(), mutations);
    return 0;
}
