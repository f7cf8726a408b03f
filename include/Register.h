/// @file
/// One device register: a bit string with an address, a data and a status part.
#pragma once

#include "RLBitVec.h"
#include "TessalExport.h"

/// A device register that travels as one bit string, the total, and is written either as a whole or part by part.
///
/// In index order, read from its left end, the total is the address, then the data, then the status. Bit i of a status
/// number, bit 0 least significant, is index S - 1 - i of a status part of S bits, so that it reads as a binary number.
///
/// The two sides stay in step lazily. After a change of a part the next getRegister() builds the total anew; after
/// updateData() the next part reader refills the parts. The caller's order of calls keeps the two from overwriting
/// each other. Repeated reads do no bit work.
///
/// Total and mask get their length at construction, and setData() or setAddress() may change a part's length: in a
/// register that also has an address or a status, the parts together must stay within the total's length. What lies
/// beyond it is not copied. A register of data alone gets a fresh total whenever it is built anew.
///
/// The register owns all its vectors. Sizes below 0 count as 0. While the environment variable
/// `TESSALREGISTERDUMPDATA` is set at construction, to whatever value, the register prints to the console what it does.
/// An object belongs to one thread at a time: its readers change it too.
class TESSAL_API Register {
public:
    /// Address and data from the first bits of byte arrays, and the low @p statusSize bits of a status number.
    Register(int addressSize, const unsigned char* address, int dataSize, const unsigned char* data, int statusSize,
             unsigned int status);
    /// Address and data copied from vectors, where null is an empty one.
    Register(const RLBitVec* address, const RLBitVec* data, int statusSize, unsigned int status);
    /// Parts of the given lengths, all bits 0.
    Register(int addressSize, int dataSize, int statusSize);
    /// An empty register without vectors: its sizes are 0, and its readers give null or 0.
    Register();
    /// An empty register as Register() makes it; operator= is what copies.
    Register(const Register& other);
    ~Register();

    /// Assigns the other's parts and total to this register's own vectors, numbering included, and copies its state.
    /// The mask, the dump setting and vectors that either register lacks stay as they are.
    Register& operator=(const Register& other);

    int getAddressSize() const;
    int getDataSize() const;
    int getStatusSize() const;
    /// The sum of the parts' present lengths.
    int getRegisterSize() const;

    void setStatus(unsigned int status);
    void setData(const unsigned char* bytes, int bits);
    /// Takes over the vector's bits: by a copy in place of the part where the lengths differ, by assignment where they
    /// are equal. Null changes nothing.
    void setData(const RLBitVec* value);
    void setAddress(const unsigned char* bytes, int bits);
    void setAddress(const RLBitVec* value);

    /// The total, built anew after a change of a part. It stays the register's; whoever writes to it calls
    /// updateData() afterwards.
    RLBitVec* getRegister();
    /// Says that the total was changed by the caller.
    void updateData() { m_splitTotal = true; }
    /// Says that a part was changed by the caller.
    void updateTotalData() { m_rebuildTotal = true; }

    /// The status part; the argument has no effect.
    RLBitVec* getStatus(bool ignored);
    /// The low 31 bits of the status as a number, extended by its bit 30.
    int getStatus();
    /// The bytes of the data part.
    const unsigned char* getData();
    /// The bytes of the address part.
    const unsigned char* getAddress();
    const RLBitVec* getDataVector();

    /// Compares the totals, each built anew where needed, without the status part.
    bool operator==(Register& other);

    /// Prints the parts as they stand, and the total, built anew where needed, to the console.
    void display();
    /// Prints the total as it stands to the console.
    void registerDisplay();

private:
    void createTotalAndMask();
    void createStatus(int size, unsigned int status);
    void fillStatus(unsigned int status);
    void dumpOperands(const Register& other) const;
    /// Refills the parts when the total has changed.
    void updateNow();

    RLBitVec* m_data = nullptr;
    RLBitVec* m_status = nullptr;
    RLBitVec* m_mask = nullptr;  ///< one bit for each of the total: 0 for the status, 1 for the rest
    RLBitVec* m_address = nullptr;
    RLBitVec* m_totalData = nullptr;
    bool m_rebuildTotal = false;  ///< a part has changed
    bool m_splitTotal = false;    ///< the total has changed
    bool m_dump;
};
