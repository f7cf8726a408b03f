#include "LineSource.h"

bool LineSource::next(std::string& line) {
    if (!std::getline(m_stream, line)) {
        return false;
    }
    ++m_number;
    if (m_number == 1 && line.rfind("\xEF\xBB\xBF", 0) == 0) {
        line.erase(0, 3);
    }
    if (!line.empty() && line.back() == '\r') {
        line.pop_back();
    }
    return true;
}
