#include "program.h"

#include <algorithm>
#include <array>
#include <initializer_list>

namespace compare {
namespace {

constexpr uint32_t kAl = 0xE0000000;
constexpr unsigned kPc = 15;

// A program is a row of groups; nothing jumps into the middle of one.
class Writer {
public:
    explicit Writer(Random& random) : random_(random) {}

    std::vector<uint32_t> write(unsigned groups) {
        for (unsigned i = 0; i < groups; ++i) {
            starts_.push_back(words_.size());
            group();
        }
        starts_.push_back(words_.size());
        words_.push_back(0xE1A00000);  // mov r0, r0: where everything ends
        for (const Jump& jump : jumps_) {
            const size_t to = starts_[std::min(jump.group + jump.skipped, starts_.size() - 1)];
            const auto distance = static_cast<uint32_t>(to) - static_cast<uint32_t>(jump.place) - 2;
            words_[jump.place] |= distance & 0xFFFFFF;
        }
        return words_;
    }

private:
    struct Jump {
        size_t place, group, skipped;
    };

    uint32_t below(uint32_t limit) { return static_cast<uint32_t>(random_() % limit); }
    bool chance(uint32_t in) { return below(in) == 0; }
    uint32_t condition() { return (chance(3) ? below(15) : 14) << 28; }
    void emit(uint32_t word) { words_.push_back(word); }

    // A register that may change: not the base, not the program counter.
    uint32_t target() {
        const uint32_t choice = below(14);
        return choice >= kBaseRegister ? choice + 1 : choice;
    }
    uint32_t source() { return below(15); }
    uint32_t sourceOrPc() { return chance(12) ? kPc : source(); }

    uint32_t otherThan(std::initializer_list<uint32_t> taken) {
        for (;;) {
            const uint32_t choice = target();
            if (std::find(taken.begin(), taken.end(), choice) == taken.end()) return choice;
        }
    }

    void group() {
        switch (below(20)) {
        case 0: return multiply();
        case 1: return multiplyLong();
        case 2:
        case 3: return transfer();
        case 4:
        case 5: return halfword();
        case 6:
        case 7: return block();
        case 8: return swap();
        case 9: return status();
        case 10: return branch();
        case 11: return computedJump();
        case 12: return literal();
        default: return process();
        }
    }

    // ---- Registers only ----

    void process() {
        const uint32_t operation = below(16);
        const bool isComparison = operation >= 8 && operation < 12;
        const bool setsFlags = isComparison || chance(2);
        const uint32_t form = below(3);
        const bool isByRegister = form == 2;
        uint32_t word = condition() | operation << 21 | (setsFlags ? 1u << 20 : 0);
        if (!isComparison) word |= target() << 12;
        if (operation != 13 && operation != 15) {
            word |= (isByRegister ? source() : sourceOrPc()) << 16;
        }
        if (form == 0) {
            word |= 1u << 25 | below(4096);
        } else if (form == 1) {
            word |= (chance(3) ? 0 : below(32)) << 7 | below(4) << 5 | sourceOrPc();
        } else {
            word |= source() << 8 | below(4) << 5 | 1u << 4 | source();
        }
        emit(word);
    }

    void multiply() {
        const uint32_t d = target(), m = otherThan({d});
        const bool accumulates = chance(2);
        emit(condition() | (accumulates ? 1u << 21 | source() << 12 : 0) | below(2) << 20 |
             d << 16 | source() << 8 | 0x90 | m);
    }

    void multiplyLong() {
        const uint32_t high = target(), low = otherThan({high}), m = otherThan({high, low});
        emit(condition() | 0x00800090 | below(8) << 20 | high << 16 | low << 12 | source() << 8 |
             m);
    }

    void status() {
        switch (below(3)) {
        case 0: return emit(condition() | 0x010F0000 | target() << 12);
        case 1: return emit(condition() | 0x0128F000 | source());
        default: return emit(condition() | 0x0328F000 | below(4096));
        }
    }

    // ---- Memory ----

    // Puts an address near the middle, a multiple of `unit`, into register n.
    void setBase(uint32_t n, uint32_t unit) {
        const uint32_t up = below(2) ? 0x00800000 : 0x00400000;  // add or sub
        emit(kAl | 0x02000000 | up | kBaseRegister << 16 | n << 12 | (below(256) & ~(unit - 1)));
    }

    // Puts a small multiple of 4 into register m.
    void setOffset(uint32_t m) { emit(kAl | 0x03A00000 | m << 12 | (below(64) * 4)); }

    // P, U and W; with a base that may not change, before the access and without writing back.
    uint32_t mode(bool changes) {
        const uint32_t up = below(2) << 23;
        if (!changes) return 1u << 24 | up;
        return up | below(2) << 24 | below(2) << 21;
    }

    void transfer() {
        const bool isByte = chance(2);
        const uint32_t n = target(), d = otherThan({n}), load = below(2) << 20;
        setBase(n, 4);
        if (chance(2)) {
            const uint32_t m = otherThan({n});
            setOffset(m);
            // Shifted up by at most 2, or not at all: the offset stays small and a multiple of 4.
            const uint32_t shift = chance(2) ? below(3) << 7 : 0;
            emit(condition() | 0x06000000 | mode(true) | shift | load | (isByte ? 1u << 22 : 0) |
                 n << 16 | d << 12 | m);
            return;
        }
        const uint32_t offset = isByte ? below(4096) : below(1024) * 4;
        emit(condition() | 0x04000000 | mode(true) | load | (isByte ? 1u << 22 : 0) | n << 16 |
             d << 12 | offset);
    }

    void halfword() {
        const uint32_t n = target(), d = otherThan({n});
        const uint32_t kind = below(4);  // strh, ldrh, ldrsb, ldrsh
        const uint32_t load = kind ? 1u << 20 : 0, type = kind < 2 ? 1 : kind;
        uint32_t bits = mode(true);
        if (!(bits >> 24 & 1)) bits &= ~(1u << 21);
        setBase(n, 4);
        uint32_t word = condition() | 0x90 | bits | load | type << 5 | n << 16 | d << 12;
        if (chance(2)) {
            const uint32_t m = otherThan({n});
            setOffset(m);
            word |= m;
        } else {
            const uint32_t offset = kind == 2 ? below(256) : below(128) * 2;
            word |= 1u << 22 | (offset & 0xF0) << 4 | (offset & 15);
        }
        emit(word);
    }

    void block() {
        const bool loads = chance(2), writesBack = chance(2);
        const uint32_t n = target();
        uint32_t list = below(0x8000) & ~(loads ? 1u << kBaseRegister : 0);
        if (loads && !writesBack) {
            list |= below(2) << n;
        } else {
            list &= ~(1u << n);
            const bool isLowest = (list & ((1u << n) - 1)) == 0;
            if (!loads && (isLowest || !writesBack)) list |= below(2) << n;
        }
        if (!loads && chance(8)) list |= 1u << kPc;
        if (!list) list = n == 0 ? 2 : 1;
        setBase(n, 4);
        emit(condition() | 0x08000000 | below(4) << 23 | (writesBack ? 1u << 21 : 0) |
             (loads ? 1u << 20 : 0) | n << 16 | list);
    }

    void swap() {
        const uint32_t n = target(), d = otherThan({n}), m = otherThan({n});
        const bool isByte = chance(2);
        setBase(n, isByte ? 1 : 4);
        emit(condition() | 0x01000090 | (isByte ? 1u << 22 : 0) | n << 16 | d << 12 | m);
    }

    // Reads the program's own words, relative to the program counter.
    void literal() {
        emit(condition() | 0x05100000 | below(2) << 23 | below(2) << 22 | kPc << 16 |
             target() << 12 | below(16) * 4);
    }

    // ---- Jumps ----

    void branch() {
        jumps_.push_back({words_.size(), starts_.size() - 1, 1 + below(4)});
        emit(condition() | (chance(2) ? 0x0B000000 : 0x0A000000));
    }

    // To the end of the group, by each instruction that can write the program counter.
    void computedJump() {
        const uint32_t n = target();
        switch (below(4)) {
        case 0:
            emit(kAl | 0x028F0000 | n << 12 | 4);  // add n, pc, #4
            emit(kAl | 0x01A0F000 | n);            // mov pc, n
            break;
        case 1:
            emit(kAl | 0x03A00000 | n << 12);  // mov n, #0
            emit(kAl | 0x008FF100 | n);        // add pc, pc, n, lsl #2
            break;
        case 2: {
            const uint32_t base = otherThan({n});
            setBase(base, 4);
            emit(kAl | 0x028F0000 | n << 12 | 8);           // add n, pc, #8
            emit(kAl | 0x05800000 | base << 16 | n << 12);  // str n, [base]
            emit(kAl | 0x0590F000 | base << 16);            // ldr pc, [base]
            break;
        }
        default: {
            const uint32_t base = otherThan({n});
            setBase(base, 4);
            emit(kAl | 0x028F0000 | n << 12 | 8);           // add n, pc, #8
            emit(kAl | 0x09200000 | base << 16 | 1u << n);  // stmdb base!, {n}
            emit(kAl | 0x08B08000 | base << 16);            // ldmia base!, {pc}
            break;
        }
        }
        process();  // skipped
    }

    Random& random_;
    std::vector<uint32_t> words_;
    std::vector<size_t> starts_;
    std::vector<Jump> jumps_;
};

}  // namespace

std::vector<uint32_t> RandomProgram(Random& random, unsigned groups) {
    return Writer(random).write(groups);
}

uint32_t RandomValue(Random& random) {
    static constexpr std::array<uint32_t, 16> kEdges = {
        0,   1,   2,          31,         32,         33,         63,         64,
        255, 256, 0x7FFFFFFF, 0x80000000, 0x80000001, 0xFFFFFFFF, 0xFFFF8000, 0x00010000};
    const auto number = static_cast<uint32_t>(random());
    switch (number >> 30) {
    case 0: return kEdges[number & 15];
    case 1: return number & 63;
    default: return static_cast<uint32_t>(random());
    }
}

}  // namespace compare
