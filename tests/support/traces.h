// What the library traces while a Traces object lives, message by message, line ends included.
#ifndef TRACES_H
#define TRACES_H

#include "qvstrace.h"

#include <cstring>
#include <string>
#include <vector>

class Traces {
public:
    Traces() : before(qvs::traceSink), outer(current)
    {
        current = this;
        qvcTraceSetSink([](const char *text, uint32_t length) {
            current->texts.emplace_back(text, length);
            current->terminated = current->terminated && std::strlen(text) == length;
        });
    }
    Traces(const Traces &) = delete;
    Traces &operator=(const Traces &) = delete;
    ~Traces()
    {
        qvcTraceSetSink(before);
        current = outer;
    }

    bool has(const std::string &text) const
    {
        for (const std::string &known : texts) {
            if (known == text) {
                return true;
            }
        }
        return false;
    }

    std::vector<std::string> texts;
    bool terminated = true; // every text ended where its length said

private:
    static inline Traces *current = nullptr;
    qvcTraceSink before;
    Traces *outer;
};

#endif
