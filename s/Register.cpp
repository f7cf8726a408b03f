#include "Register.h"

#include <algorithm>

#include "HkEnv.h"
#include "HkFile.h"
#include "HkStream.h"
#include "s/BitKernels.h"
#include "s/BitVecAccess.h"

namespace {

constexpr std::size_t numberBits = 32;
constexpr std::size_t noPosition = 0xFFFFFFFFU;  // what a search without a find gives

std::size_t sizeOf(int bits) {
    return bits > 0 ? static_cast<std::size_t>(bits) : 0;
}

std::size_t lengthOf(const RLBitVec* part) {
    return part != nullptr ? part->length() : 0;
}

RLBitVec* copyOf(const RLBitVec* part) {
    return part != nullptr ? new RLBitVec(*part) : new RLBitVec();
}

/// Puts a new vector in the place of a former one, which may hold what the new one was made from.
void replace(RLBitVec*& part, RLBitVec* value) {
    delete part;
    part = value;
}

void take(RLBitVec*& part, const RLBitVec* value) {
    if (value == nullptr) {
        return;
    }
    if (part == nullptr || part->length() != value->length()) {
        replace(part, copyOf(value));
    } else {
        *part = *value;
    }
}

void assign(RLBitVec* part, const RLBitVec* value) {
    if (part != nullptr && value != nullptr) {
        *part = *value;
    }
}

/// Writes the part to the indexes of the total from `first` on, as far as the total reaches.
void join(RLBitVec& total, std::size_t first, const RLBitVec* part) {
    if (part != nullptr && first < total.length()) {
        BitVecAccess::copyIndexes(total, first, *part, 0, std::min(part->length(), total.length() - first));
    }
}

/// Reads the part from there.
void split(RLBitVec* part, const RLBitVec& total, std::size_t first) {
    if (part != nullptr && first < total.length()) {
        BitVecAccess::copyIndexes(*part, 0, total, first, std::min(part->length(), total.length() - first));
    }
}

/// The storage positions, from 0 up, that the mask hides: the status bits. All positions above are seen.
std::size_t hiddenBits(const RLBitVec* mask) {
    const std::size_t first = mask != nullptr ? mask->firstTrue() : 0;
    return first != noPosition ? first : mask->length();
}

LRBitVec masked(const LRBitVec& total, const LRBitVec& mask) {
    return mask.length() < total.length() ? total : total & mask;
}

LRBitVec bitsOf(const RLBitVec* part) {
    return part != nullptr ? LRBitVec(*part) : LRBitVec();
}

void printLine(const char* title, const LRBitVec& bits) {
    HkFile::getCout() << title << bits << HkStream::endl;
}

}  // namespace

Register::Register() : m_dump(HkEnv::GetEnv("TESSALREGISTERDUMPDATA") != nullptr) {}

Register::Register(const Register&) : Register() {}

Register::Register(int addressSize, const unsigned char* address, int dataSize, const unsigned char* data,
                   int statusSize, unsigned int status)
    : Register() {
    m_address = new RLBitVec(address, sizeOf(addressSize));
    m_data = new RLBitVec(data, sizeOf(dataSize));
    createStatus(statusSize, status);
    createTotalAndMask();
    m_rebuildTotal = true;
}

Register::Register(const RLBitVec* address, const RLBitVec* data, int statusSize, unsigned int status) : Register() {
    m_address = copyOf(address);
    m_data = copyOf(data);
    createStatus(statusSize, status);
    createTotalAndMask();
    m_rebuildTotal = true;
}

Register::Register(int addressSize, int dataSize, int statusSize) : Register() {
    m_address = new RLBitVec(sizeOf(addressSize));
    m_data = new RLBitVec(sizeOf(dataSize));
    createStatus(statusSize, 0);
    createTotalAndMask();
}

Register::~Register() {
    delete m_address;
    delete m_data;
    delete m_status;
    delete m_mask;
    delete m_totalData;
}

Register& Register::operator=(const Register& other) {
    if (this == &other) {
        return *this;
    }
    assign(m_status, other.m_status);
    assign(m_data, other.m_data);
    assign(m_address, other.m_address);
    assign(m_totalData, other.m_totalData);
    m_rebuildTotal = other.m_rebuildTotal;
    m_splitTotal = other.m_splitTotal;
    return *this;
}

void Register::createStatus(int size, unsigned int status) {
    m_status = new RLBitVec(sizeOf(size));
    fillStatus(status);
}

void Register::createTotalAndMask() {
    const std::size_t status = lengthOf(m_status);
    const std::size_t total = lengthOf(m_address) + lengthOf(m_data) + status;
    m_totalData = new RLBitVec(total);
    m_mask = new RLBitVec(total, true);
    BitKernels::fillBits(BitVecAccess::bytes(*m_mask), 0, status, false);
}

void Register::fillStatus(unsigned int status) {
    const std::size_t size = m_status->length();
    for (std::size_t i = numberBits; i < size; ++i) {
        m_status->clearBit(size - 1 - i);
    }
    m_status->updateBitField(status, 0, static_cast<int>(std::min(size, numberBits)), false);
}

int Register::getAddressSize() const {
    return static_cast<int>(lengthOf(m_address));
}

int Register::getDataSize() const {
    return static_cast<int>(lengthOf(m_data));
}

int Register::getStatusSize() const {
    return static_cast<int>(lengthOf(m_status));
}

int Register::getRegisterSize() const {
    return static_cast<int>(lengthOf(m_address) + lengthOf(m_data) + lengthOf(m_status));
}

// ---- Writing the parts.

void Register::setStatus(unsigned int status) {
    m_rebuildTotal = true;
    if (m_status == nullptr) {
        return;
    }
    fillStatus(status);
    if (m_dump) {
        printLine("status: ", bitsOf(m_status));
    }
}

void Register::setData(const unsigned char* bytes, int bits) {
    replace(m_data, new RLBitVec(bytes, sizeOf(bits)));
    m_rebuildTotal = true;
}

void Register::setData(const RLBitVec* value) {
    take(m_data, value);
    m_rebuildTotal = true;
}

void Register::setAddress(const unsigned char* bytes, int bits) {
    replace(m_address, new RLBitVec(bytes, sizeOf(bits)));
    m_rebuildTotal = true;
}

void Register::setAddress(const RLBitVec* value) {
    take(m_address, value);
    m_rebuildTotal = true;
}

// ---- The total.

RLBitVec* Register::getRegister() {
    if (!m_rebuildTotal) {
        return m_totalData;
    }
    m_rebuildTotal = false;
    HkStream& console = HkFile::getCout();
    if (m_dump) {
        console << "ReCalculating ..." << HkStream::endl;
    }
    const std::size_t address = lengthOf(m_address);
    if (address == 0 && lengthOf(m_status) == 0) {
        if (m_dump) {
            console << "Address and status are zero,using Data to populate totalData, no recalculating ..."
                    << HkStream::endl;
        }
        replace(m_totalData, copyOf(m_data));
    } else if (m_totalData != nullptr) {
        join(*m_totalData, 0, m_address);
        join(*m_totalData, address, m_data);
        join(*m_totalData, address + lengthOf(m_data), m_status);
    }
    if (m_dump) {
        printLine("", bitsOf(m_totalData));
    }
    return m_totalData;
}

void Register::updateNow() {
    if (!m_splitTotal) {
        return;
    }
    m_splitTotal = false;
    if (m_totalData == nullptr) {
        return;
    }
    const std::size_t address = lengthOf(m_address);
    const std::size_t status = address + lengthOf(m_data);
    split(m_address, *m_totalData, 0);
    if (address == 0 && lengthOf(m_status) == 0) {
        assign(m_data, m_totalData);
    } else {
        split(m_data, *m_totalData, address);
    }
    split(m_status, *m_totalData, status);
}

// ---- Reading the parts.

RLBitVec* Register::getStatus(bool) {
    updateNow();
    return m_status;
}

int Register::getStatus() {
    updateNow();
    const std::size_t size = lengthOf(m_status);
    const std::size_t used = std::min(size, numberBits);
    std::uint32_t value = 0;
    for (std::size_t index = size - used; index < size; ++index) {
        value = value << 1 | static_cast<std::uint32_t>(m_status->testBit(index));
    }
    return static_cast<int>(value << 1) >> 1;
}

const unsigned char* Register::getData() {
    updateNow();
    return m_data != nullptr ? m_data->data() : nullptr;
}

const unsigned char* Register::getAddress() {
    updateNow();
    return m_address != nullptr ? m_address->data() : nullptr;
}

const RLBitVec* Register::getDataVector() {
    updateNow();
    return m_data;
}

// ---- Comparing and printing.

bool Register::operator==(Register& other) {
    if (this == &other) {
        return true;
    }
    if (m_dump) {
        dumpOperands(other);
    }
    const RLBitVec* const left = getRegister();
    const RLBitVec* const right = other.getRegister();
    if (left == nullptr || right == nullptr) {
        return left == right;
    }
    const std::size_t length = left->length();
    if (length != right->length()) {
        return false;
    }
    const std::size_t leftHidden = std::min(hiddenBits(m_mask), length);
    const std::size_t rightHidden = std::min(hiddenBits(other.m_mask), length);
    // Where one mask hides what the other shows, the shown bits meet zeros.
    const std::size_t shown = std::min(leftHidden, rightHidden);
    const std::size_t common = std::max(leftHidden, rightHidden);
    const RLBitVec& alone = leftHidden < rightHidden ? *left : *right;
    return BitKernels::findBit(alone.data(), shown, common - shown, true) == common &&
           BitKernels::equalBits(left->data(), right->data(), common, length - common);
}

void Register::dumpOperands(const Register& other) const {
    const LRBitVec left = bitsOf(m_totalData);
    const LRBitVec leftMask = bitsOf(m_mask);
    const LRBitVec right = bitsOf(other.m_totalData);
    const LRBitVec rightMask = bitsOf(other.m_mask);
    printLine("Operand1 data ", left);
    printLine("Mask ", leftMask);
    printLine("Operand2 data ", right);
    printLine("Mask ", rightMask);
    printLine("&", masked(left, leftMask));
    printLine("&", masked(right, rightMask));
}

void Register::display() {
    printLine("Address: ", bitsOf(m_address));
    printLine("Data: ", bitsOf(m_data));
    printLine("Status: ", bitsOf(m_status));
    const RLBitVec* const total = getRegister();
    printLine("Total Register", bitsOf(total));
}

void Register::registerDisplay() {
    printLine("Register: ", bitsOf(m_totalData));
}
