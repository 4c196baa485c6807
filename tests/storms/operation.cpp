#include "storms/operation.h"

#include "storms/arguments.h"

#include <cstring>
#include <istream>
#include <ostream>
#include <sstream>

namespace kortest {
namespace {

constexpr int kDeepestTrap = 2;

size_t DepthOf(const std::string& line) {
    const size_t depth = line.find_first_not_of('>');
    return depth == std::string::npos ? line.size() : depth;
}

// Where an operation of this depth belongs: the list inside the last ones written, or null.
Sequence* ListAt(Sequence& sequence, size_t depth) {
    Sequence* list = &sequence;
    for (; depth > 0; --depth) {
        if (list->empty()) return nullptr;
        list = &list->back().inside;
    }
    return list;
}

}  // namespace

void Write(std::ostream& stream, const Operation& operation, int depth) {
    stream << std::string(static_cast<size_t>(depth), '>') << operation.word->name;
    for (size_t i = 0; operation.word->kinds[i]; ++i) stream << ' ' << operation.arguments[i];
    stream << '\n';
    for (const Operation& inner : operation.inside) Write(stream, inner, depth + 1);
}

void Vocabulary::add(const Word* words, size_t count) {
    for (size_t i = 0; i < count; ++i) {
        words_.push_back(&words[i]);
        weight_ += words[i].weight;
    }
}

Operation Vocabulary::draw(RandomSource& random, int depth) const {
    Operation operation;
    if (depth < kDeepestTrap && random.oneIn(12)) {
        operation.word = &kTrapWord;
        for (int i = random.from(1, 3); i > 0; --i) {
            operation.inside.push_back(draw(random, depth + 1));
        }
    } else {
        int place = random.below(weight_);
        size_t i = 0;
        while (place >= words_[i]->weight) place -= words_[i++]->weight;
        operation.word = words_[i];
    }
    for (size_t i = 0; operation.word->kinds[i]; ++i) {
        operation.arguments[i] = DrawArgument(random, operation.word->kinds[i]);
    }
    return operation;
}

const Word* Vocabulary::find(const std::string& name) const {
    if (name == kTrapWord.name) return &kTrapWord;
    for (const Word* word : words_) {
        if (name == word->name) return word;
    }
    return nullptr;
}

bool Vocabulary::read(std::istream& stream, Sequence& sequence) const {
    std::string line;
    while (std::getline(stream, line)) {
        if (!line.empty() && line.back() == '\r') line.pop_back();
        if (line.empty() || line[0] == '#') continue;
        const size_t depth = DepthOf(line);
        std::istringstream text(line.substr(depth));
        std::string name;
        text >> name;
        Operation operation;
        operation.word = find(name);
        Sequence* list = ListAt(sequence, depth);
        if (!operation.word || !list) return false;
        for (size_t i = 0; operation.word->kinds[i]; ++i) {
            if (!(text >> operation.arguments[i])) return false;
        }
        list->push_back(operation);
    }
    return true;
}

}  // namespace kortest
