// The queries of a session, all of them with all indexes that make a difference.
#pragma once

#include "support/fakevm.h"

#include <string>

namespace fuzz {

// Asks every query of the context with every index from -1 to one past the end (of more than 40
// records with those at both ends and some between), and holds every count to the number of answers
// that are found. Returns all answers as text.
std::string askAll(fakevm::Vm *vm);

// Asks each query of the context once, with indexes of 1.
void askEach(fakevm::Vm *vm);

} // namespace fuzz
