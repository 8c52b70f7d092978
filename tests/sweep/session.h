// A whole session of a Java program with the library: a parse for the header alone, its queries,
// the delete; a parse, every query, the choice of an access point, the delete.
#pragma once

#include "qvsClientProvCtx.h"
#include "support/fakevm.h"

#include <cstddef>
#include <string>
#include <vector>

namespace sweep {

using Answers = std::vector<fakevm::Answer>;

// A call of a native: what is the same in every session.
struct Call {
    enum Kind { kParse, kHeaderQuery, kQuery, kOther } kind;
    const fakevm::Native *native; // but of a parse
    std::vector<jint> arguments;  // the mode of a parse

    std::string shown() const;
};

// The calls of a session, in their order.
const std::vector<Call> &calls();

// How many blocks a context does not let go of: those of WI-FI and ROAMING records, the texts of
// XCAP, and the copies of FROM that were replaced.
size_t keptBy(const qvsClientProvCtx *context);

class Session {
public:
    explicit Session(fakevm::Bytes message) : message_(std::move(message)) {}

    // Plays the session and returns the answer to each call. Afterwards the library holds neither a
    // context nor a header.
    Answers play();

    // Plays it with every call of the virtual machine that can fail failing in turn, and the native
    // called again: with a failing call a native answers nothing, and as ever without. With a parse
    // that failed there is nothing to be asked.
    Answers playFailing();

    // How many calls have failed in it.
    size_t failures() const { return failures_; }

    // The blocks that the contexts of the last session leave behind by design: an allocation that
    // fails may bring to light what another record would have hidden.
    size_t keptByContexts() const { return kept_; }

private:
    fakevm::Answer ask(const Call &call);
    void failEach(const Call &call);

    fakevm::Bytes message_;
    size_t failures_ = 0;
    size_t kept_ = 0;
};

} // namespace sweep
