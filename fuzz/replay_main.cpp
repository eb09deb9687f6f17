// Replays fuzz inputs through LLVMFuzzerTestOneInput without the fuzzing engine, so the corpus
// doubles as a regression test in ordinary builds. Arguments are input files or directories of them.
// A crash or sanitizer report ends the process, which fails the test.

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <filesystem>
#include <fstream>
#include <iostream>
#include <iterator>
#include <vector>

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size);

namespace {

std::vector<std::filesystem::path> collectInputs(const std::filesystem::path& argument) {
    std::vector<std::filesystem::path> inputs;
    if (std::filesystem::is_directory(argument)) {
        for (const auto& entry : std::filesystem::directory_iterator(argument)) {
            if (entry.is_regular_file()) {
                inputs.push_back(entry.path());
            }
        }
        std::sort(inputs.begin(), inputs.end());
    } else {
        inputs.push_back(argument);
    }
    return inputs;
}

bool readInput(const std::filesystem::path& file, std::vector<std::uint8_t>& bytes) {
    std::ifstream stream(file, std::ios::binary);
    if (!stream) {
        return false;
    }
    bytes.assign(std::istreambuf_iterator<char>(stream), std::istreambuf_iterator<char>());
    return !stream.bad();
}

bool replay(const std::filesystem::path& file) {
    std::vector<std::uint8_t> bytes;
    if (!readInput(file, bytes)) {
        std::cerr << "cannot read " << file.string() << '\n';
        return false;
    }
    std::cout << "replaying " << file.string() << std::endl;
    // The engine never passes a null pointer, not even for an empty input.
    static const std::uint8_t emptyInput = 0;
    LLVMFuzzerTestOneInput(bytes.empty() ? &emptyInput : bytes.data(), bytes.size());
    return true;
}

} // namespace

int main(int argc, char** argv) {
    if (argc < 2) {
        std::cerr << "usage: " << argv[0] << " <input file or directory>...\n";
        return 2;
    }
    std::size_t passed = 0;
    std::size_t failed = 0;
    for (int index = 1; index < argc; ++index) {
        const std::filesystem::path argument(argv[index]);
        if (!std::filesystem::exists(argument)) {
            std::cerr << "no such input: " << argument.string() << '\n';
            ++failed;
            continue;
        }
        for (const auto& file : collectInputs(argument)) {
            if (replay(file)) {
                ++passed;
            } else {
                ++failed;
            }
        }
    }
    std::cout << passed << " passed, " << failed << " failed" << std::endl;
    return failed == 0 ? 0 : 1;
}
