// Random operations on every kind of vector, in step with the plain model; whole arrays are compared, slack included.
#include <gtest/gtest.h>

#include <memory>

#include "Chance.h"
#include "Model.h"
#include "RLBitVec.h"
#include "VectorWidth.h"
#include "s/BitVecAccess.h"

namespace {

template <Numbering chosen>
struct Numbered : NumberedVec {
    Numbered() : NumberedVec(RLBitVec(), chosen) {}
};
/// Shows whether every appended bit has gone through it.
struct Inverting : RLBitVec {
    bool addBit(bool value) override { return RLBitVec::addBit(!value); }
};

template <class Kind>
constexpr Numbering numberingOf = std::is_same_v<Kind, LRBitVec> ? Numbering::Storage : Numbering::Usual;
template <Numbering chosen>
constexpr Numbering numberingOf<Numbered<chosen>> = chosen;

/// Makes the call of that number.
template <class... Calls>
void choose(std::size_t number, Calls... calls) {
    std::size_t next = 0;
    ((next++ == number ? calls() : void()), ...);
}

// A vector as the base class sees it: its operators are other ones than those of the class itself.
LRBitVec& base(LRBitVec& vector) {
    return vector;
}
Model& base(Model& model) {
    return model;
}

template <class Vector>
class Duel {
    static constexpr bool mirrors = !std::is_same_v<Vector, LRBitVec>;
    static constexpr bool inverts = std::is_same_v<Vector, Inverting>;

public:
    /// One operation on one vector, with the other one or itself at its right side, in blocks of either width.
    void step() {
        const VectorWidth width(chance.coin());
        const std::size_t active = chance.below(2);
        const std::size_t right = chance.below(8) == 0 ? active : 1 - active;
        Model& model = models[active];
        if (model.length > 700 || chance.below(40) == 0) {
            model.length = chance.size(std::min<std::size_t>(model.capacity, 80));
            vectors[active].setNumberBits(model.length);
        }
        // The slack means nothing, so it may be anything.
        const std::size_t slackEnd = chance.below(20) == 0 ? 8 * model.bytes.size() : 0;
        for (std::size_t p = model.length; p < slackEnd; ++p) {
            model.put(p, true);
            BitVecAccess::bytes(vectors[active])[p / 8] = model.bytes[p / 8];
        }
        run(vectors[active], model, vectors[right], models[right]);
    }

    void expectAgreement() const {
        for (std::size_t i = 0; i < 2; ++i) {
            ASSERT_EQ(Model(vectors[i]).state(), models[i].state()) << "after operation " << operation;
        }
        ASSERT_TRUE(readingAgrees) << "in operation " << operation;
    }

private:
    void run(Vector& a, Model& mine, Vector& b, Model& theirs) {
        const bool value = chance.coin();
        const bool own = mirrors && chance.coin();
        const std::size_t shift = chance.size(mine.length);
        const std::size_t inside = chance.size(mine.capacity);
        const std::size_t more = mine.length + chance.size(100);
        const std::size_t any = chance.size(300);
        const std::string text = chance.digits(chance.below(10) == 0 ? 150 : chance.size(40));
        const auto both = [&](auto call) {
            return [&, call] {
                call(a, b);
                call(mine, theirs);
            };
        };
        operation = chance.below(mirrors ? 19 : 15);
        if (operation < 3 && theirs.length < mine.length) {
            return;  // the right side of a combination must be long enough
        }
        choose(
            operation, both([&](auto& v, auto& w) { v &= w; }), both([&](auto& v, auto& w) { v ^= w; }),
            both([&](auto& v, auto& w) { v |= w; }),
            both([&](auto& v, auto&) { shift % 2 == 0 ? void(v.addBit(value)) : void(v += value); }),
            both([&](auto& v, auto&) { v.setCapacity(more); }),
            both([&](auto& v, auto& w) { value ? void(v.concatenate(w)) : void(base(v) += w); }),
            both([&](auto& v, auto&) { value ? v.addHex(text.c_str()) : void(v += text.c_str()); }),
            both([&](auto& v, auto&) { v.setSize(inside, value); }), both([&](auto& v, auto&) { v.resize(any); }),
            both([&](auto& v, auto&) { own ? void(v << shift) : void(v.rightShift(shift)); }),
            both([&](auto& v, auto&) { own ? void(v >> shift) : void(v.leftShift(shift)); }),
            both([&](auto& v, auto& w) { base(v) = w; }),
            both([&](auto& v, auto&) { value ? void(base(v) = shift % 2 != 0) : void(!base(v)); }),
            [&] { access(a, mine); }, [&] { read(a, mine, b, theirs); }, [&] { join(a, mine, b, theirs); });
        if constexpr (mirrors) {
            operation > 15 ? updateField(a, mine, b, theirs) : void();
        }
    }

    void access(Vector& a, Model& mine) {
        if (mine.length == 0) {
            return;
        }
        const std::size_t index = chance.size(mine.length - 1);
        const std::size_t other = chance.size(mine.length - 1);
        const bool bit = mine.read(index);
        const bool otherBit = mine.read(other);
        const std::size_t way = chance.below(5);
        readingAgrees = a.testBit(index) == bit;
        choose(
            way, [&] { a.setBit(index); }, [&] { a.clearBit(index); }, [&] { a[index] = a(other); },
            [&] { a(index) |= otherBit; }, [&] { a[index] ^= true; });
        const bool expected[]{true, false, otherBit, bit || otherBit, !bit};
        mine.write(index, expected[way]);
    }

    void read(const Vector& a, const Model& mine, const Vector& b, const Model& theirs) {
        LRBitVec same(a);
        same.setCapacity(mine.capacity + 9);
        const auto turned = !a;
        const std::vector<bool> bits = mine.bits();
        const auto first = [&](bool value) {
            const auto found = std::find(bits.begin(), bits.end(), value);
            return found != bits.end() ? static_cast<std::size_t>(found - bits.begin()) : 0xFFFFFFFF;
        };
        const auto ones = static_cast<std::size_t>(std::count(bits.begin(), bits.end(), true));
        const bool isEqual = bits == theirs.bits();
        readingAgrees = a.firstTrue() == first(true) && a.firstFalse() == first(false) && (a == b) == isEqual &&
                        (a != b) != isEqual && a.count() == ones && same == a &&
                        std::hash<LRBitVec>()(same) == std::hash<LRBitVec>()(a) &&
                        turned.count() == mine.length - ones && (a & turned).count() == 0 &&
                        turned.getCapacity() == mine.length + 7;
    }

    void join(Vector& a, Model& mine, const Vector& b, const Model& theirs) {
        if constexpr (mirrors) {
            const std::unique_ptr<RLBitVec> joined(&(a + b));
            readingAgrees = Model(*joined).state() == mine.joined(theirs).state();
            if (mine.numbering == Numbering::Usual) {  // which it would become
                a += b;
                mine.join(theirs);
            }
        }
    }

    void updateField(Vector& a, Model& mine, const Vector& b, const Model& theirs) {
        const std::size_t room = mine.numbering == Numbering::Usual ? mine.capacity : mine.length;
        const std::size_t start = chance.size(room);
        const bool flag = chance.coin();
        const auto value = static_cast<unsigned>(chance.below(0x100000000));
        const std::size_t count = operation == 16   ? theirs.length
                                  : operation == 17 ? chance.size(std::min<std::size_t>(room - start, 32))
                                                    : chance.size((room - start) / 8) * 8;
        if (count > room - start) {
            return;
        }
        const std::string bytes = chance.bytes(count / 8);
        std::vector<bool> bits;
        for (std::size_t k = 0; k < count; ++k) {
            bits.push_back(operation == 16   ? theirs.read(count - 1 - k)
                           : operation == 17 ? (value >> (flag ? count - 1 - k : k) & 1) != 0
                                             : (bytes[k / 8] >> (flag ? k % 8 : 7 - k % 8) & 1) != 0);
        }
        const int first = static_cast<int>(start);
        const std::size_t spared = count > 0 ? chance.below(8) : 0;
        choose(
            operation - 16, [&] { a.updateBitField(&b, first, flag); },
            [&] { a.updateBitField(value, first, static_cast<int>(count), flag); },
            [&] { a.updateBitField(bytes.data(), first, static_cast<int>(count - spared), flag); });
        for (std::size_t k = 0; k < count; ++k) {
            mine.put(mine.place(mine.length - start - 1 - k), bits[k]);
        }
    }

    Chance chance;
    Vector vectors[2];
    Model models[2]{Model({}, numberingOf<Vector>, inverts), Model({}, numberingOf<Vector>, inverts)};
    std::size_t operation = 0;
    bool readingAgrees = true;
};

template <class Kind>
class RandomOperations : public testing::Test {};
using Kinds =
    testing::Types<LRBitVec, RLBitVec, Numbered<Numbering::Forward>, Numbered<Numbering::Mirrored>, Inverting>;
TYPED_TEST_SUITE(RandomOperations, Kinds, );

TYPED_TEST(RandomOperations, AgreeWithThePlainModel) {
    Duel<TypeParam> duel;
    for (int step = 0; step < 50000 && !this->HasFailure(); ++step) {
        duel.step();
        duel.expectAgreement();
    }
}

}  // namespace
