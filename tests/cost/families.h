// Messages made to cost as much as their size allows: each family repeats one piece of a document
// until a size is reached.
#pragma once

#include "qvsresult.h"

#include <cstddef>
#include <cstdint>
#include <string>
#include <vector>

namespace cost {

using Bytes = std::vector<uint8_t>;

struct Family {
    std::string name;
    Bytes open{};
    Bytes unit{};   // repeated
    Bytes middle{}; // stands between the units and their ends
    Bytes end{};    // repeated as often, behind the middle
    Bytes close{};
    std::string table{};  // the string table
    size_t tableText = 0; // percent of the message: a text at the end of the string table
    // Of a decode: QVS_ERROR_NO_MEMORY when the texts pass the limit that a message has, which is
    // 8 MiB and 100 times its length.
    qvsResult result = QVS_OK;

    // The blocks that the context has for each unit, at least: a record and its text are two.
    size_t blocks = 0;

    // Whether the limit is what bounds the heap. Such a family says little of smaller messages.
    bool aboutLimit = false;
};

// All of them, in an order that stays: first the one that has nothing to repeat, whose session is
// what every session costs.
const std::vector<Family> &families();

// The family of that name, which there must be.
const Family &family(const std::string &name);

// How many units there are in a message of the family and of at most `size` bytes.
size_t unitsOf(const Family &family, size_t size);

// A pushed message of at most `size` bytes with as many units as fit.
Bytes messageOf(const Family &family, size_t size);

} // namespace cost
