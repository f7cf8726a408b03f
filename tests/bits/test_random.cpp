// Random operations on every kind of vector, in step with the plain model; whole arrays are compared, slack included.
#include <gtest/gtest.h>

#include <cstdlib>
#include <cstring>
#include <memory>
#include <random>

#include "Model.h"
#include "RLBitVec.h"
#include "s/BitVecAccess.h"
#include "s/WideVectors.h"

namespace {

struct Forward : RLBitVec {
    Forward() { m_forwardIndex = 1; }
};
struct Mirrored : RLBitVec {
    Mirrored() { m_forwardIndex = m_byteMirrorIndex = 7; }
};
struct Watching : RLBitVec {
    std::vector<bool> seen;
    bool addBit(bool value) override {
        seen.push_back(value);
        return RLBitVec::addBit(value);
    }
};
struct Narrow {};  // RLBitVec, with narrow blocks only

template <class Kind>
constexpr Numbering numberingOf = std::is_same_v<Kind, LRBitVec>   ? Numbering::Storage
                                  : std::is_same_v<Kind, Forward>  ? Numbering::Forward
                                  : std::is_same_v<Kind, Mirrored> ? Numbering::Mirrored
                                                                   : Numbering::Usual;

class Chance {
public:
    explicit Chance(unsigned seed) : m_random(seed) {}
    std::size_t below(std::size_t limit) { return m_random() % limit; }
    bool coin() { return below(2) != 0; }
    /// Up to the limit, often at a border of words.
    std::size_t size(std::size_t limit) {
        const std::size_t border = 64 * below(limit / 64 + 1) + below(3);
        return coin() ? below(limit + 1) : std::min(limit, border > 0 ? border - 1 : 0);
    }
    std::string hexText() {
        std::string text(below(10) == 0 ? 150 : size(40), '0');
        for (char& digit : text) {
            digit = below(50) == 0 ? static_cast<char>(1 + below(255)) : "0123456789abcdefABCDEF"[below(22)];
        }
        return text;
    }

private:
    std::mt19937_64 m_random;
};

template <class Kind>
class Duel {
    using Vector = std::conditional_t<std::is_same_v<Kind, Narrow>, RLBitVec, Kind>;
    static constexpr bool mirrors = !std::is_same_v<Kind, LRBitVec>;

public:
    explicit Duel(unsigned seed) : chance(seed) {
        wideVectors = wideVectors && !std::is_same_v<Kind, Narrow>;
        models[0].numbering = models[1].numbering = numberingOf<Kind>;
    }
    ~Duel() { wideVectors = m_wide; }

    /// One operation on one vector, with the other one or itself at its right side.
    void step() {
        const std::size_t active = chance.below(2);
        const std::size_t right = chance.below(8) == 0 ? active : 1 - active;
        Model& model = models[active];
        if (model.length > 700 || chance.below(40) == 0) {
            model.length = chance.size(std::min<std::size_t>(model.capacity, 80));
            vectors[active].setNumberBits(model.length);
        }
        operation = chance.below(mirrors ? 26 : 22);
        run(vectors[active], model, vectors[right], models[right]);
    }

    testing::AssertionResult agrees() const {
        for (std::size_t i = 0; i < 2; ++i) {
            const Vector& vector = vectors[i];
            const Model& model = models[i];
            const std::vector<unsigned char> bytes(vector.data(), vector.data() + vector.nbytes());
            if (vector.length() != model.length || vector.getCapacity() != model.capacity || bytes != model.bytes ||
                !readingAgrees) {
                return testing::AssertionFailure()
                       << "after operation " << operation << ": length " << vector.length() << " for " << model.length
                       << ", capacity " << vector.getCapacity() << " for " << model.capacity << ", bytes "
                       << testing::PrintToString(bytes) << " for " << testing::PrintToString(model.bytes);
            }
        }
        return testing::AssertionSuccess();
    }

    Chance chance;
    Vector vectors[2];
    Model models[2];

private:
    void run(Vector& a, Model& mine, Vector& b, Model& theirs) {
        const bool value = chance.coin();
        const std::size_t shift = chance.size(mine.length);
        LRBitVec& base = a;
        switch (operation) {
            case 0:
                a.addBit(value);
                return mine.addBit(value);
            case 1: {
                const std::size_t bits = mine.length + chance.size(100);
                a.setCapacity(bits);
                return mine.setCapacity(bits);
            }
            case 2:
            case 3:
                value ? base += b : a.concatenate(b);
                return mine.append(theirs);
            case 4:
            case 5: {
                const std::string text = chance.hexText();
                value ? base += text.c_str() : (a.addHex(text.c_str()), base);
                return mine.addHex(text);
            }
            case 6: {
                const std::size_t bits = chance.size(mine.capacity);
                a.setSize(bits, value);
                return mine.setSize(bits, value);
            }
            case 7: {
                const std::size_t bits = chance.size(300);
                a.resize(bits);
                return mine.resize(bits);
            }
            case 8:
            case 9:
                value ? base >> shift : (a.rightShift(shift), base);
                return mine.shiftUp(shift);
            case 10:
            case 11:
                value ? base << shift : (a.leftShift(shift), base);
                return mine.shiftDown(shift);
            case 12:
                base = b;
                return mine.assign(theirs);
            case 13:
                base.LRBitVec::operator=(value);
                return std::fill(mine.bytes.begin(), mine.bytes.end(), static_cast<unsigned char>(value ? 0xFF : 0));
            case 14:
                !base;
                return mine.combine(mine, [](int x, int) { return ~x; });
            case 15:
            case 16:
            case 17:
                return combine(base, mine, b, theirs);
            case 18:  // the slack means nothing, so it may be anything
                for (std::size_t p = mine.length; p < 8 * mine.bytes.size(); ++p) {
                    mine.put(p, true);
                    BitVecAccess::bytes(a)[p / 8] = mine.bytes[p / 8];
                }
                return;
            case 19:
            case 20:
                return access(a, mine);
            case 21:
                return read(a, mine, b, theirs);
            default:
                if constexpr (mirrors) {
                    mirroredOperation(a, mine, b, theirs);
                }
        }
    }

    void combine(LRBitVec& a, Model& mine, const LRBitVec& b, const Model& theirs) {
        if (theirs.length < mine.length) {
            return;
        }
        if (operation == 15) {
            a &= b;
            mine.combine(theirs, [](int x, int y) { return x & y; });
        } else if (operation == 16) {
            a ^= b;
            mine.combine(theirs, [](int x, int y) { return x ^ y; });
        } else {
            a |= b;
            mine.combine(theirs, [](int x, int y) { return x | y; });
        }
    }

    void access(Vector& a, Model& mine) {
        if (mine.length == 0) {
            return;
        }
        const std::size_t index = chance.size(mine.length - 1);
        const std::size_t other = chance.size(mine.length - 1);
        readingAgrees = a.testBit(index) == mine.bit(mine.place(index));
        const bool otherBit = mine.bit(mine.place(other));
        switch (chance.below(5)) {
            case 0:
                a.setBit(index);
                return mine.put(mine.place(index), true);
            case 1:
                a.clearBit(index);
                return mine.put(mine.place(index), false);
            case 2:
                a[index] = a(other);
                return mine.put(mine.place(index), otherBit);
            case 3:
                a(index) |= otherBit;
                return mine.put(mine.place(index), mine.bit(mine.place(index)) || otherBit);
            default:
                a[index] ^= true;
                return mine.put(mine.place(index), !mine.bit(mine.place(index)));
        }
    }

    void read(const Vector& a, const Model& mine, const Vector& b, const Model& theirs) {
        std::size_t ones = 0;
        for (std::size_t i = 0; i < mine.length; ++i) {
            ones += mine.bit(i) ? 1 : 0;
        }
        LRBitVec same(a);
        same.setCapacity(mine.capacity + 9);
        const LRBitVec turned = !static_cast<const LRBitVec&>(a);
        readingAgrees = a.firstTrue() == mine.first(true) && a.firstFalse() == mine.first(false) &&
                        (a == b) == mine.equal(theirs) && (a != b) != mine.equal(theirs) && a.count() == ones &&
                        same == a && std::hash<LRBitVec>()(same) == std::hash<LRBitVec>()(a) &&
                        turned.count() == mine.length - ones && turned.getCapacity() == mine.length + 7;
    }

    template <class Right>
    void mirroredOperation(Right& a, Model& mine, Right& b, Model& theirs) {
        if (operation < 24) {
            const std::unique_ptr<RLBitVec> joined(&(a + b));
            const Model expected = mine.joined(theirs);
            readingAgrees = joined->getCapacity() == expected.capacity &&
                            std::memcmp(joined->data(), expected.bytes.data(), expected.bytes.size()) == 0;
            return;
        }
        const bool usual = mine.numbering == Numbering::Usual;
        const std::size_t room = usual ? mine.capacity : mine.length;
        const std::size_t start = chance.size(room);
        const bool flag = chance.coin();
        std::vector<bool> bits;
        if (operation == 24) {
            if (theirs.length > room - start) {
                return;
            }
            for (std::size_t i = theirs.length; i-- > 0;) {
                bits.push_back(theirs.bit(theirs.place(i)));
            }
            a.updateBitField(&b, static_cast<int>(start), flag);
        } else if (chance.coin()) {
            const std::size_t count = chance.size(std::min<std::size_t>(room - start, 32));
            const auto value = static_cast<unsigned>(chance.below(0x100000000));
            for (std::size_t k = 0; k < count; ++k) {
                bits.push_back((value >> (flag ? count - 1 - k : k) & 1) != 0);
            }
            a.updateBitField(value, static_cast<int>(start), static_cast<int>(count), flag);
        } else {
            const std::size_t size = chance.size((room - start) / 8);
            std::string bytes;
            for (std::size_t k = 0; k < 8 * size; ++k) {
                bytes += k % 8 == 0 ? std::string(1, static_cast<char>(chance.below(256))) : "";
                bits.push_back((bytes.back() >> (flag ? k % 8 : 7 - k % 8) & 1) != 0);
            }
            const std::size_t spared = size > 0 ? chance.below(8) : 0;
            a.updateBitField(bytes.data(), static_cast<int>(start), static_cast<int>(8 * size - spared), flag);
        }
        mine.field(start, bits);
    }

    std::size_t operation = 0;
    bool readingAgrees = true;
    const bool m_wide = wideVectors;
};

/// The seed of a run: TESSAL_TEST_SEED, to repeat a run that failed.
unsigned seedOfRun() {
    const char* const text = std::getenv("TESSAL_TEST_SEED");
    return text != nullptr ? static_cast<unsigned>(std::strtoul(text, nullptr, 10)) : std::random_device()();
}

template <class Kind>
class RandomOperations : public testing::Test {};
using Kinds = testing::Types<LRBitVec, RLBitVec, Narrow, Forward, Mirrored, Watching>;
TYPED_TEST_SUITE(RandomOperations, Kinds, );

TYPED_TEST(RandomOperations, AgreeWithThePlainModel) {
    const unsigned seed = seedOfRun();
    SCOPED_TRACE("TESSAL_TEST_SEED=" + std::to_string(seed));
    Duel<TypeParam> duel(seed);
    for (int step = 0; step < 40000; ++step) {
        duel.step();
        ASSERT_TRUE(duel.agrees()) << "at step " << step;
    }
}

TYPED_TEST(RandomOperations, NoticeADamagedModel) {
    Duel<TypeParam> duel(1);
    for (int step = 0; step < 200; ++step) {
        duel.step();
        Model& model = duel.models[step % 2];
        if (!model.bytes.empty()) {
            model.bytes.back() ^= 0x80;
            ASSERT_FALSE(duel.agrees());
            model.bytes.back() ^= 0x80;
        }
    }
}

TEST(DerivedVector, SeesEveryAppendedBitInOrder) {
    Watching vector;
    vector += "1f";
    vector.addHex("x8z");
    LRBitVec& base = vector;
    base += LRBitVec(3, true);
    vector.concatenate(vector);
    vector += false;
    std::string seen;
    for (const bool bit : vector.seen) {
        seen += bit ? '1' : '0';
    }
    EXPECT_EQ(seen,
              "00011111"
              "10001000"
              "111"
              "0001111110001000111"
              "0");
}

}  // namespace
