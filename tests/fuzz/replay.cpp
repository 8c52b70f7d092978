// Runs the inputs that are named, files or folders with all they hold, through the target that this
// program is linked with: a fuzz target without a fuzzer.
#include "target.h"

#include <csignal>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <string>
#include <unistd.h>
#include <vector>

extern "C" [[gnu::weak]] void __sanitizer_set_death_callback(void (*callback)());

namespace {

std::string current; // the input that is run

void nameInput()
{
    const std::string line = "the input is " + current + "\n";
    (void)!write(STDERR_FILENO, line.data(), line.size());
}

bool run(const std::filesystem::path &file)
{
    std::ifstream stream(file, std::ios::binary);
    const std::vector<char> bytes((std::istreambuf_iterator<char>(stream)), {});
    if (!stream.is_open()) {
        fprintf(stderr, "%s cannot be read\n", file.c_str());
        return false;
    }
    current = file;
    (void)LLVMFuzzerTestOneInput(reinterpret_cast<const uint8_t *>(bytes.data()), bytes.size());
    return true;
}

} // namespace

int main(int argc, char **argv)
{
    if (__sanitizer_set_death_callback) {
        __sanitizer_set_death_callback(nameInput);
    }
    signal(SIGABRT, [](int) { nameInput(); });
    size_t inputs = 0;
    for (int i = 1; i < argc; ++i) {
        if (!std::filesystem::is_directory(argv[i])) {
            if (!run(argv[i])) {
                return 2;
            }
            ++inputs;
            continue;
        }
        for (const auto &entry : std::filesystem::recursive_directory_iterator(argv[i])) {
            if (entry.is_regular_file()) {
                if (!run(entry.path())) {
                    return 2;
                }
                ++inputs;
            }
        }
    }
    printf("%zu inputs replayed\n", inputs);
    return inputs == 0 ? 2 : 0;
}
