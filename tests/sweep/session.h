// A whole session of a Java program with the library: load, parse for the header alone, delete,
// parse, every query, the choice of an access point, delete, parse again, delete.
#pragma once

#include "support/fakevm.h"

#include <cstddef>
#include <ostream>
#include <string>
#include <vector>

namespace sweep {

// A call of a native and what it answered.
struct Step {
    std::string call;
    fakevm::Answer answer;

    bool operator==(const Step &) const = default;
};

void PrintTo(const Step &step, std::ostream *out);

using Steps = std::vector<Step>;

class Session {
public:
    explicit Session(fakevm::Bytes message) : message_(std::move(message)) {}

    // Plays the session to its end, or to a load that fails. Afterwards the library holds neither a
    // context nor a header.
    Steps play();

    // The calls of the last play() that the virtual machine could have let fail.
    long fallibleCalls() const { return fallibleCalls_; }

    // The blocks that the contexts of the last play leave behind by design: an allocation that
    // fails may bring to light what another record would have hidden.
    size_t keptByContexts() const { return keptByContexts_; }

    // Plays it with the n-th of those calls failing, counted from 0.
    Steps playFailing(long n);

    // Plays it with each of those calls failing in turn and the native called once more: a native
    // with a failing call must answer nothing, and as ever when it is called again.
    Steps playRepeating();

private:
    struct Run;

    fakevm::Bytes message_;
    long fallibleCalls_ = 0;
    size_t keptByContexts_ = 0;
};

} // namespace sweep
