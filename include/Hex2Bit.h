/// @file
/// Conversions between text, numbers, byte buffers and bit vectors.
#pragma once

#include <cstdint>
#include <memory>
#include <string_view>

#include "RLBitVec.h"
#include "TessalExport.h"

/// Static conversions between text, numbers, byte buffers and RLBitVec.
///
/// **Bits.** Indexes are those of RLBitVec: in a vector of L bits index i is storage position L - i - 1, and storage
/// position p is bit p & 7, least significant first, of byte p >> 3. A vector whose derived class chose another
/// numbering is read and written in that one, bit by bit.
///
/// **Fill.** Every vector or byte array that a conversion creates starts filled with m_initValue, slack included; so
/// does one that a conversion clears first.
///
/// **Ownership.** `std::unique_ptr` results belong to the caller. Plain arrays that are handed out are new ones, which
/// the caller releases with `delete[]`, unless it is told otherwise.
///
/// **Bad input.** Null texts and null data count as empty, a null vector is one of length 0, negative sizes and counts
/// are 0. A size must not exceed the vector's length: that is an assertion in debug builds, and in release builds the
/// bits that fall on indexes beyond the vector are passed over. A byte buffer must have the bytes that its count tells.
///
/// **Threads.** m_initValue is not protected, and the conversions from a number to a new vector also write one private
/// word: callers keep these apart. The texts that convertInt2HexString() keeps are behind a lock, and the other
/// conversions hold no state.
class TESSAL_API Hex2Bit {
public:
    /// The fill value, false at first.
    static bool m_initValue;
    /// Sets the fill value of all later conversions.
    static void setInitValue(bool value) { m_initValue = value; }

    // ---- Text into vectors and byte arrays
    //
    // Hex text is one stream of bits. Without byteSwap the characters are taken from left to right and each digit
    // gives its bits from the most significant on. With byteSwap the characters are taken in pairs, the second one
    // first, and each digit gives its bits from the least significant on; a last character without partner stands
    // alone. Digits are 0-9, a-f and A-F; other characters give no bits and are passed over.
    //
    // When the text, each character counted as four bits, is longer than `size`, so many of the stream's first bits
    // are dropped: a text that is too long loses its left end. The k-th bit that remains goes to index k, or to index
    // size - 1 - k with descending. Indexes that no bit reaches keep their value.
    //
    // The text 12a5 in 16 bits gives these bytes of data():
    //
    //     descending  byteSwap  bytes
    //     false       false     A5 12   the number, least significant byte first
    //     false       true      A5 48   each byte mirrored, last text byte first
    //     true        false     48 A5   each byte mirrored, in text order
    //     true        true      12 A5   the bytes of the text as they stand

    /// Loads hex text into the vector. With @p initialise the vector is first filled with m_initValue, which also
    /// returns it to the usual numbering.
    static void convertHexString2BitVec(RLBitVec* vec, const char* hexString, int size, bool descending, bool byteSwap,
                                        bool initialise);
    static void convertHexString2BitVec(RLBitVec* vec, std::string_view hexString, int size, bool descending,
                                        bool byteSwap, bool initialise);
    /// Loads hex text into a new vector of @p size bits. With @p leftFill a text that is too short is first filled up
    /// on the left with `size` / 4 - length digits 0.
    static std::unique_ptr<RLBitVec> convertHexString2BitVec(const char* hexString, int size, bool descending,
                                                             bool byteSwap, bool leftFill);
    static std::unique_ptr<RLBitVec> convertHexString2BitVec(std::string_view hexString, int size, bool descending,
                                                             bool byteSwap, bool leftFill);
    /// Loads hex text into a new array of (@p size + 14) / 8 bytes, laid out as a vector of that size.
    static std::unique_ptr<unsigned char[]> convertHexString2BinData(const char* hexString, int size, bool descending,
                                                                     bool byteSwap);
    /// Loads hex text without byteSwap into the vector.
    static void convertBpiHexString2BitVec(RLBitVec* vec, const char* hexString, int size, bool descending);

    /// Loads at most @p size characters of binary text: character k, unless it is `0`, sets index k, or index
    /// size - 1 - k with @p descending. No bit is cleared.
    static void convertBinString2BitVec(RLBitVec* vec, const char* binString, int size, bool descending);
    static std::unique_ptr<RLBitVec> convertBinString2BitVec(const char* binString, int size, bool descending);
    /// The same into a new array of (@p size + 14) / 8 bytes, laid out as a vector of that size.
    static std::unique_ptr<unsigned char[]> convertBinString2BinData(const char* binString, int size, bool descending);

    /// Loads @p count bytes, whatever they hold, by way of hex text, into a new vector of four bits a digit. A byte
    /// from 0x10 to 0x7F gives two digits, a byte below 0x10 one digit, and a byte from 0x80 on eight digits that
    /// begin with ffffff, since it is taken as a negative number.
    static std::unique_ptr<RLBitVec> convertString2BitVec(const char* text, int count, bool descending, bool byteSwap);
    static std::unique_ptr<RLBitVec> convertString2BitVec(std::string_view text, bool descending, bool byteSwap);
    /// The same into the vector. When the hex text needs more bits than the vector has, the size is the vector's
    /// length, so that the text loses its left end.
    static void convertString2BitVec(RLBitVec* vec, const char* text, int count, bool descending, bool byteSwap);

    // ---- Byte buffers

    /// The byte with its bits in reverse order.
    static unsigned char swapBits(unsigned char byte);
    /// A new array of the @p n bytes, each with its bits in reverse order.
    static unsigned char* reverseBufferBits(const unsigned char* buffer, int n);
    /// Reverses the bits of each byte in place.
    static void reverseReadBufferBits(unsigned char* buffer, int n);
    /// Exchanges bytes 0 and 1, 2 and 3 and so on in place; an odd last byte stays. Gives the buffer.
    static unsigned char* swapBytes(unsigned char* buffer, int n);

    // ---- Bytes and vectors to text
    //
    // Binary text becomes hex text of lower-case digits in one of two ways. Digit mode: each four characters are one
    // digit, the first one most significant. Byte mode: each eight characters are one byte, the first one least
    // significant, and the byte's high digit is written first. Missing characters at the end count as 0.
    //
    // The bytes A1 0F with 16 bits give:
    //
    //     positionOrder  byteMode  text
    //     false          false     0fa1
    //     false          true      f085
    //     true           false     85f0
    //     true           true      a10f

    /// The first @p nBits bits as new binary text: from storage position 0 up with @p positionOrder, otherwise from
    /// the highest one down, so that it reads as a binary number.
    static char* convertBinData2BinString(const unsigned char* data, int nBits, bool positionOrder);
    /// The binary text of convertBinData2BinString() as new hex text.
    static char* convertBinData2HexString(const unsigned char* data, int nBits, bool positionOrder, bool byteMode);
    /// The first @p n characters of binary text as new hex text. Only the character `1` counts as 1; what a shorter
    /// text lacks counts as 0.
    static char* convertBinString2HexString(const char* binText, int n, bool byteMode);
    static char* convertBinString2HexString(std::string_view binText, bool byteMode);

    /// Writes the vector's bits from index 0 up, eight a character, the first one most significant, to @p out, which
    /// has room for length / 8 + 1 characters. An incomplete last group is dropped, and so is a zero character. At a
    /// character above 127 the conversion stops with a status message and gives false, or, with @p stopAtNonAscii
    /// false, passes over it.
    static bool convertBitVec2String(const RLBitVec* vec, char* out, bool stopAtNonAscii);
    static bool convertBitVec2String(const RLBitVec* vec, char* out);
    /// @p nDigits hex digits of the vector from storage position @p address * @p bitsPerAddress up, as byte mode
    /// writes them; new text. Null when the address is the vector's end or lies outside of it. Bits past the end count
    /// as 0.
    static const char* getHexStringByHexAddress(const RLBitVec* vec, int address, int nDigits, int bitsPerAddress);

    // ---- Text and bytes to numbers
    //
    // The result holds 31 bits: of a longer pattern the higher ones are lost.

    /// The first @p nBits bits as a number, storage position 0 being the least significant one.
    static int convertBin2Int(const unsigned char* data, int nBits);
    static std::int32_t convertBin2Long(const unsigned char* data, int nBits);
    /// The hex text, loaded into a new vector of 4 * @p nDigits bits, as a number whose most significant bit is index
    /// 0. So a longer text loses its left end, and a shorter one is followed by the fill value.
    static int convertHexString2Int(const char* hexText, int nDigits);
    static std::int32_t convertHexString2Long(const char* hexText, int nDigits);

    // ---- Numbers into vectors

    /// Fills the vector with m_initValue, without touching its numbering, then writes the value's bits from the least
    /// significant up to its highest 1: from index length - 1 down, or with @p fromIndexZero from index 0 up. Bits
    /// that find no index are lost. A value below 1 leaves the fill. The second argument is not used.
    static void convertInt2BitVec(unsigned int value, int unused, RLBitVec* vec, bool fromIndexZero);
    static void convertInt2BitVec(unsigned int value, int unused, RLBitVec* vec);
    static void convertInt2BitVec(int value, int unused, RLBitVec* vec, bool fromIndexZero);
    static void convertInt2BitVec(int value, int unused, RLBitVec* vec);
    /// A new vector of @p size bits filled with m_initValue, in which the 1 bits of a value of at least 1 are set,
    /// from index size - 1 down for the least significant one up.
    static std::unique_ptr<RLBitVec> convertInt2BitVec(int value, int size);
    static std::unique_ptr<RLBitVec> convertLong2BitVec(std::int32_t value, int size);
    /// The same with a size that suits the value: a multiple of 4, at least what the value needs, and 4 more for a
    /// value whose bits are 4, 8, ... or 28 ones. 0 for 0 and 32 for a negative value.
    static std::unique_ptr<RLBitVec> convertInt2BitVec(int value);

    // ---- Numbers to text

    /// The value in hex, as many digits as convertInt2BitVec(int) makes groups of four bits: 1 gives `1`, 15 gives
    /// `0f`, 255 gives `0ff`, 256 gives `100`; 0 gives `00000000`, and so does a negative value. The text belongs to
    /// the library and stays unchanged until the process ends, so that even destructors of statics may read it; a text
    /// is kept once, however often it is asked for.
    static const char* convertInt2HexString(int value);
    /// The two 16-bit halves exchanged, as eight new hex digits; a negative value counts as 0.
    static char* swapWord(std::int32_t value);

    /// Does nothing.
    static void display() {}

private:
    /// Steps the counters of the bit-by-bit loader: false, with both moved on, while the bit has no index.
    static bool checkIfValidIndex(int& index, bool descending, int& limit);
    static void loadBitByBit(RLBitVec& vec, std::string_view hexString, int size, bool descending, bool byteSwap);

    /// The vector that a conversion from a number created latest, for a look with a debugger; not owned, never read.
    static RLBitVec* m_binData;
};
