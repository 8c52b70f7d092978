// Runs the inputs that are named, files or folders with all they hold, through the target that this
// program is linked with: a fuzz target without a fuzzer.
#include "target.h"

#include <csignal>
#include <cstdio>
#include <dirent.h>
#include <memory>
#include <string>
#include <unistd.h>
#include <vector>

extern "C" [[gnu::weak]] void __sanitizer_set_death_callback(void (*callback)());

namespace {

std::string current; // the input that is run
size_t inputs = 0;   // that have been run

void nameInput()
{
    const std::string line = "the input is " + current + "\n";
    (void)!write(STDERR_FILENO, line.data(), line.size());
}

// One file. Of C's library alone, which the memory sanitizer knows.
bool runFile(const std::string &name)
{
    const std::unique_ptr<FILE, int (*)(FILE *)> stream(fopen(name.c_str(), "rb"), fclose);
    if (!stream) {
        fprintf(stderr, "%s cannot be read\n", name.c_str());
        return false;
    }
    std::vector<uint8_t> bytes;
    uint8_t part[4096];
    for (size_t got = 1; got != 0;) {
        got = fread(part, 1, sizeof part, stream.get());
        bytes.insert(bytes.end(), part, part + got);
    }
    current = name;
    (void)LLVMFuzzerTestOneInput(bytes.data(), bytes.size());
    ++inputs;
    return true;
}

// A file, or a folder with all it holds.
bool run(const std::string &name)
{
    const std::unique_ptr<DIR, int (*)(DIR *)> folder(opendir(name.c_str()), closedir);
    if (!folder) {
        return runFile(name);
    }
    while (const dirent *entry = readdir(folder.get())) {
        if (entry->d_name[0] != '.' && !run(name + '/' + entry->d_name)) {
            return false;
        }
    }
    return true;
}

} // namespace

int main(int argc, char **argv)
{
    if (__sanitizer_set_death_callback) {
        __sanitizer_set_death_callback(nameInput);
    }
    signal(SIGABRT, [](int) { nameInput(); });
    for (int i = 1; i < argc; ++i) {
        if (!run(argv[i])) {
            return 2;
        }
    }
    printf("%zu inputs replayed\n", inputs);
    return inputs == 0 ? 2 : 0;
}
