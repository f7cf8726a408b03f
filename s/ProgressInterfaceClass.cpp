#include "ProgressInterfaceClass.h"

#include <new>

namespace {

// The two objects live as long as the library is loaded and are never destroyed, so that progress may be reported from
// other units' destructors; in memory of the library's own they leave nothing behind when it is unloaded.
alignas(Callback) unsigned char recordMemory[sizeof(Callback)];
alignas(CallbackFunction) unsigned char functionMemory[sizeof(CallbackFunction)];

}  // namespace

Callback* ProgressInterfaceClass::m_cbData = new (recordMemory) Callback;
CallbackFunction* ProgressInterfaceClass::m_callback = new (functionMemory) CallbackFunction;

bool ProgressInterfaceClass::setCallbackFunction(bool (*function)(Callback&)) {
    if (m_callback != nullptr) {
        m_callback->setFunction(function);
    }
    return true;
}

bool ProgressInterfaceClass::callCallbackFunction() {
    if (m_cbData == nullptr) {
        return true;
    }
    return m_callback != nullptr && m_callback->callFunction(*m_cbData);
}

bool ProgressInterfaceClass::startProgressUpdate(int total, const char* text) {
    if (m_cbData != nullptr) {
        m_cbData->setProgressStatus(PROGRESS_START);
        m_cbData->setCurrentCount(0);
        m_cbData->setTotalCount(total);
        m_cbData->setCallbackText(text);
    }
    return callCallbackFunction();
}

bool ProgressInterfaceClass::startProgressUpdate(int total) {
    return startProgressUpdate(total, "");
}

bool ProgressInterfaceClass::updateProgress() {
    if (m_cbData != nullptr) {
        const int done = m_cbData->getCurrentCount();
        const int total = m_cbData->getTotalCount();
        if (total == 0 || done > total) {
            return false;
        }
        m_cbData->setProgressStatus(PROGRESS_UPDATE);
        m_cbData->setCurrentCount(static_cast<int>(static_cast<unsigned int>(done) + 1U));
    }
    return callCallbackFunction();
}

bool ProgressInterfaceClass::setProgressText(const char* text) {
    if (m_cbData != nullptr) {
        m_cbData->setProgressStatus(PROGRESS_TEXT);
        m_cbData->setCallbackText(text);
    }
    return callCallbackFunction();
}

bool ProgressInterfaceClass::endProgressUpdate() {
    if (m_cbData != nullptr) {
        if (m_cbData->getTotalCount() == 0) {
            return false;
        }
        m_cbData->setProgressStatus(PROGRESS_END);
        m_cbData->setCurrentCount(m_cbData->getTotalCount());
    }
    return callCallbackFunction();
}

bool ProgressInterfaceClass::stopProgressUpdate() {
    if (m_cbData != nullptr) {
        m_cbData->setProgressStatus(PROGRESS_END);
    }
    return callCallbackFunction();
}

void ProgressInterfaceClass::setTessalMode(tESSALNS::MODE_TYPE mode) {
    if (m_cbData != nullptr) {
        m_cbData->setMode(mode);
    }
}

void ProgressInterfaceClass::setTessalSubMode(tESSALNS::SUBMODE_TYPE subMode) {
    if (m_cbData != nullptr) {
        m_cbData->setSubMode(subMode);
    }
}
