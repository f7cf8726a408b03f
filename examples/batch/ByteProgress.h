// The progress of an operation over many bytes.
#pragma once

#include <cstdint>

/// Reports an operation through the library's progress interface while it lives. One operation at a time.
///
///     ByteProgress progress("programming", image.size());
///     while (...) { ...; progress.add(sent); }
class ByteProgress {
public:
    /// @param title what is being done, as in "programming"
    ByteProgress(const char* title, std::uint64_t total);
    ByteProgress(const ByteProgress&) = delete;
    ByteProgress& operator=(const ByteProgress&) = delete;
    /// Ends the operation; where bytes are missing it is shown as stopped there.
    ~ByteProgress();

    /// So many bytes more are done.
    void add(std::uint64_t bytes);

private:
    std::uint64_t m_total;
    std::uint64_t m_done = 0;
    int m_reported = 0;  ///< steps of a hundredth
};
