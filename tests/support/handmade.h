// Provisioning contexts made by hand, and the natives over them: the queries are tested without a
// message, a decoder or a heap block of the library.
#pragma once

#include "support/fakevm.h"

#include "qvsJniParser.h"

#include <gtest/gtest.h>

#include <cstring>
#include <deque>
#include <map>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

namespace handmade {

// A context that is the current one while it lives. It owns all that is added to it.
class Context {
public:
    Context() { ptCtx = &root_; }
    ~Context() { ptCtx = nullptr; }
    Context(const Context &) = delete;
    Context &operator=(const Context &) = delete;

    qvsClientProvCtx *operator->() { return &root_; }

    // A new record, all fields null.
    template <class Record>
    Record *record()
    {
        auto made = std::make_shared<Record>();
        owned_.push_back(made);
        return made.get();
    }

    // A new record at the end of a chain.
    template <class Record>
    Record *add(Record **chain)
    {
        while (*chain) {
            chain = &(*chain)->ptNext;
        }
        return *chain = record<Record>();
    }

    // A new text at the end of a list.
    void add(qvsCtxStrNode **list, std::string_view value)
    {
        add<qvsCtxStrNode>(list)->pszValue = text(value);
    }

    // A text with the zero bytes behind it that a copy in the library has, and nothing behind them.
    char *text(std::string_view value)
    {
        texts_.push_back(std::make_unique<char[]>(value.size() + 5));
        std::copy(value.begin(), value.end(), texts_.back().get());
        return texts_.back().get();
    }

    // Sets a field of a record by its number, from 1. All fields are pointers.
    template <class Record>
    void set(Record *target, size_t field, char *value)
    {
        ASSERT_LE(field * sizeof value, sizeof *target);
        memcpy(reinterpret_cast<char *>(target) + (field - 1) * sizeof value, &value, sizeof value);
    }

    // Sets fields 1 to `fields` to texts of their own: `name`, a dot and the number of the field.
    template <class Record>
    void fill(Record *target, size_t fields, const std::string &name)
    {
        for (size_t field = 1; field <= fields; ++field) {
            set(target, field, text(name + "." + std::to_string(field)));
        }
    }

private:
    qvsClientProvCtx root_{};
    std::deque<std::shared_ptr<void>> owned_;
    std::deque<std::unique_ptr<char[]>> texts_;
};

// A machine that has loaded the library.
struct LoadedVm : fakevm::Vm {
    LoadedVm() { EXPECT_EQ(load().number, JNI_VERSION_1_4); }

    // The answers by their kind.
    jint number(std::string_view native, std::initializer_list<jint> indexes = {})
    {
        return call(native, indexes).number;
    }
    fakevm::Text text(std::string_view native, std::initializer_list<jint> indexes = {})
    {
        return call(native, indexes).text;
    }
    std::optional<fakevm::Array> array(std::string_view native,
                                       std::initializer_list<jint> indexes = {})
    {
        return call(native, indexes).array;
    }
};

// A field of a record that an array shows under another text.
struct Translated {
    std::string stored;
    std::string shown;
};

// Holds the answer of a String[] native to its layout: an element for each of the fields 1 to
// `fields` of the record, in their order, and a last one that is null. With all fields, with none,
// with each alone and with each missing.
template <class Record>
void expectLayout(Context &context, fakevm::Vm &vm, const char *native,
                  std::initializer_list<jint> indexes, Record *record, size_t fields,
                  const std::map<size_t, Translated> &translated = {})
{
    const auto expectElements = [&](const auto &isSet) {
        fakevm::Array expected;
        for (size_t field = 1; field <= fields; ++field) {
            const auto known = translated.find(field);
            const Translated texts = known != translated.end()
                                         ? known->second
                                         : Translated{std::to_string(field), std::to_string(field)};
            context.set(record, field, isSet(field) ? context.text(texts.stored) : nullptr);
            expected.push_back(isSet(field) ? fakevm::Text(texts.shown) : std::nullopt);
        }
        expected.push_back(std::nullopt);
        EXPECT_EQ(vm.call(native, indexes), fakevm::Answer{.array = expected}) << native;
    };
    expectElements([](size_t) { return true; });
    expectElements([](size_t) { return false; });
    for (size_t one = 1; one <= fields; ++one) {
        expectElements([one](size_t field) { return field == one; });
        expectElements([one](size_t field) { return field != one; });
    }
}

} // namespace handmade
