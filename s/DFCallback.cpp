#include "DFCallback.h"

DFCallback* DFCallback::m_instance = nullptr;

DFCallback* DFCallback::Instance() {
    if (m_instance == nullptr) {
        m_instance = new DFCallback;
    }
    return m_instance;
}

void DFCallback::readStream(std::istream&) {}

void DFCallback::writeStream(std::ostream&) {}

bool DFCallbackFunction::callFunction(DFCallback* record) {
    if (m_function == nullptr || record == nullptr) {
        return false;
    }
    const int input = record->getUserInput();
    return input != 1 && input != 2 && m_function(*record);
}
