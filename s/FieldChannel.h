// The transfers and field forms that sockets and pipes share.
#pragma once

#include <cstdint>

#include "s/UnitOrigin.h"

/// What a transport reports where a transfer fails. Each text takes the host's error number as "%d".
struct TransferReports {
    UnitOrigin origin;
    const char* receiveFailed;
    const char* sendFailed;
    const char* textFailed;       ///< behind sendFailed, when the characters of a string could not be sent
    const char* receivedNothing;  ///< behind receiveFailed, in readSocket; null for none
    const char* sentNothing;      ///< behind sendFailed, in writeSocket; null for none
};

/// One connection, for the time of one operation.
///
/// Every transfer moves all of its bytes or fails, with a report; a peer that has closed is a failure. A length below
/// 1 succeeds without a call of the host; null data of any other length fails without one.
class FieldChannel {
public:
    explicit FieldChannel(const TransferReports& reports) : m_reports(reports) {}

    bool read(char* data, int length);
    bool write(const char* data, int length);
    /// 4 in any case; after a failure the value is 0.
    int readInt(int* value);
    /// 4, or 0 after a failure.
    int writeInt(int value);
    /// Leaves the value alone after a failure.
    bool readBool(bool* value);
    bool writeBool(bool value);
    /// The text's length in any case.
    int writeString(const char* text);
    bool readSocket(char* data, int length);
    bool writeSocket(const char* data, int length);

protected:
    ~FieldChannel() = default;

    // Number of bytes moved, at least 1; 0 where the peer has closed, and -1 for a failure whose number failure()
    // gives.

    virtual std::int64_t receiveSome(char* data, int length) = 0;
    virtual std::int64_t sendSome(const char* data, int length) = 0;
    virtual int failure() const = 0;

private:
    void report(const char* text) const;
    int sent(const char* data, int length);
    bool writeTogether(int length, const char* text);

    const TransferReports& m_reports;
    int m_error = 0;
};
