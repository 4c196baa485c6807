// What a storm is made of: numbered records, each an operation with whole numbers as arguments. A
// sequence of them is a pure function of control and seed, whatever happens when it is run, so that
// it can be written down, replayed and shortened.
#pragma once

#include "storms/random_source.h"

#include <array>
#include <iosfwd>
#include <string>
#include <vector>

namespace kortest {

class Stage;

constexpr int kMostArguments = 6;

using Arguments = std::array<int, kMostArguments>;

// A kind of operation. `kinds` has a letter for each argument, see DrawArgument.
struct Word {
    const char* name;
    int weight;  // how often it is drawn, among those of its control
    const char* kinds;
    void (*run)(Stage& stage, const Arguments& arguments);
};

struct Operation {
    const Word* word = nullptr;
    Arguments arguments{};
    std::vector<Operation> inside;  // of a trap: what happens when it is sprung
};

using Sequence = std::vector<Operation>;

// "grid.zoom 4"; operations inside of a trap follow in lines of their own, with ">" before each.
void Write(std::ostream& stream, const Operation& operation, int depth = 0);

class Vocabulary {
public:
    void add(const Word* words, size_t count);
    template <size_t count>
    void add(const Word (&words)[count]) {
        add(words, count);
    }

    Operation draw(RandomSource& random, int depth = 0) const;

    // False for a text that is no sequence.
    bool read(std::istream& stream, Sequence& sequence) const;

private:
    const Word* find(const std::string& name) const;

    std::vector<const Word*> words_;
    int weight_ = 0;
};

// The operation that has others inside.
extern const Word kTrapWord;

}  // namespace kortest
