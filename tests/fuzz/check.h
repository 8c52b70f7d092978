// A property that does not hold ends the program with a message, so that the input is kept.
#pragma once

#include <cstdio>
#include <cstdlib>
#include <sstream>
#include <string>

namespace fuzz {

[[noreturn]] inline void fail(const char *property, const std::string &details)
{
    fprintf(stderr, "PROPERTY VIOLATED: %s\n%s%s", property, details.c_str(),
            details.empty() ? "" : "\n");
    abort();
}

// check: ends the program unless the property holds. What follows it is written with the message:
//   check(count == answers, "every count agrees with its answers", name, ' ', count);
template <class... Details>
void check(bool holds, const char *property, const Details &...details)
{
    if (!holds) [[unlikely]] {
        std::ostringstream text;
        ((text << details), ...);
        fail(property, text.str());
    }
}

} // namespace fuzz
