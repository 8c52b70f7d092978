// repeat COUNT MESSAGE.push LIBRARY.so: parses and releases a message so many times.
// repeat COUNT MESSAGE.floor: does the heap work of its records so many times.
// For a tool that counts instructions: two counts, and the difference divided.
#include "work.h"

#include <cstdio>
#include <cstdlib>

int main(int argc, char **argv)
{
    if (argc < 3 || argc > 4) {
        fputs("usage: repeat COUNT MESSAGE.floor | repeat COUNT MESSAGE.push LIBRARY.so\n", stderr);
        return 2;
    }
    const long count = strtol(argv[1], nullptr, 10);
    if (argc == 3) {
        bench::Floor floor(argv[2]);
        for (long i = 0; i < count; ++i) {
            floor.replay();
        }
        return 0;
    }
    const std::vector<uint8_t> message = bench::readFile(argv[2]);
    const bench::Library library(argv[3]);
    for (long i = 0; i < count; ++i) {
        if (!library.parseAndRelease(message)) {
            fprintf(stderr, "repeat: %s is refused\n", argv[2]);
            return 1;
        }
    }
    return 0;
}
