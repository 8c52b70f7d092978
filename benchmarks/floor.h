// The floor: what the records of a document cost on the heap, and nothing else. It replays the
// steps that benchmarks/blocks has written for the document with plain malloc, calloc, memcpy and
// free.
#ifndef BENCH_FLOOR_H
#define BENCH_FLOOR_H

#include <cstddef>
#include <cstdint>
#include <string>
#include <vector>

namespace bench {

class Floor {
public:
    // Reads a file of steps. Says what is wrong on standard error and ends the program if it
    // cannot.
    explicit Floor(const std::string &path);

    // All steps once.
    void replay();

    // How many blocks they make.
    size_t blocks() const { return m_blocks.size(); }

private:
    enum class Kind : uint8_t { Record, Table, Text, Copy, Free };

    struct Step {
        Kind kind;
        uint32_t size;   // of the block
        uint32_t copied; // bytes that are copied into it
        uint32_t block;  // the one that is copied, or released
    };

    void add(const std::string &what, const std::string &argument);

    std::vector<Step> m_steps;
    std::vector<char *> m_blocks;
    std::vector<uint32_t> m_lengths; // of the texts in them, with the NUL
    std::vector<char> m_document;    // what texts are copied from
};

} // namespace bench

#endif
