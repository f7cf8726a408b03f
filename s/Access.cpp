#include "Access.h"

#include <array>
#include <cstdint>
#include <cstdio>
#include <utility>

#include "HkMessageManager.h"
#include "UnitOrigin.h"
#include "platform/NamedSemaphore.h"

namespace {

constexpr UnitOrigin origin{"../s/Access", "$Revision: 1.1 $"};

constexpr int clientSlots = 5;

struct Kind {
    const char* prefix;
    std::int32_t units;
};

constexpr Kind shareKind{"CableSharing", 1};
constexpr Kind countKind{"CableShareCount", clientSlots};

struct Family {
    const char* name;
    int offset;
};

constexpr Family families[] = {{"LPT", 20}, {"USB", 40}, {"USB2", 60}, {"COM", 80}};

constexpr int shareBase = 100;
constexpr int countBase = 1000;

/// True if @p text is @p name, which is in upper case, in any case of its letters.
bool isName(const char* text, const char* name) {
    for (; *name != '\0'; ++text, ++name) {
        const bool isLowerCase = *name >= 'A' && *text == *name - 'A' + 'a';
        if (*text != *name && !isLowerCase) {
            return false;
        }
    }
    return *text == '\0';
}

const Family* findFamily(const char* name) {
    for (const Family& family : families) {
        if (isName(name, family.name)) {
            return &family;
        }
    }
    return nullptr;
}

int sumThatWraps(int a, int b) {
    return static_cast<int>(static_cast<unsigned>(a) + static_cast<unsigned>(b));
}

/// The number that debug lines show for a handle.
unsigned long idOf(const PlatformSemaphore* semaphore) {
    return static_cast<unsigned long>(reinterpret_cast<std::uintptr_t>(semaphore));
}

PlatformSemaphore* openOrCreate(const char* name, std::int32_t units) {
    bool wasThere = false;
    PlatformSemaphore* const semaphore = NamedSemaphore::create(name, units, units, &wasThere);
    if (semaphore == nullptr) {
        const char* const reason = NamedSemaphore::explainLastError();
        origin.report().issueInfo("Semaphore %s is not available: %s.\n", name, reason);
    }
    HkMessageManager::debugStub(wasThere ? " Reusing semaphore, id=0x%08lX.\n" : " Creating semaphore, id=0x%08lX.\n",
                                idOf(semaphore));
    return semaphore;
}

PlatformSemaphore* duplicateOf(PlatformSemaphore* semaphore) {
    return semaphore != nullptr ? NamedSemaphore::duplicate(semaphore) : nullptr;
}

}  // namespace

Access::Access(int portId, ACCESS_TYPE type) : m_semaphore(nullptr), m_held(false), m_type(type) {
    const Kind& kind = type == SHARE ? shareKind : countKind;
    std::array<char, 64> name{};
    std::snprintf(name.data(), name.size(), "%s%d", kind.prefix, portId);
    HkMessageManager::debugStub(" Semaphore name = %s.\n", name.data());
    m_semaphore = openOrCreate(name.data(), kind.units);
}

Access::Access(const Access& other)
    : m_semaphore(duplicateOf(other.m_semaphore)), m_held(false), m_type(other.m_type) {}

Access::Access(Access&& other) noexcept
    : m_semaphore(std::exchange(other.m_semaphore, nullptr)),
      m_held(std::exchange(other.m_held, false)),
      m_type(other.m_type) {}

Access& Access::operator=(const Access& other) {
    if (this != &other) {
        *this = Access(other);
    }
    return *this;
}

Access& Access::operator=(Access&& other) noexcept {
    if (this == &other) {
        return *this;
    }
    const Access former(std::move(*this));
    m_semaphore = std::exchange(other.m_semaphore, nullptr);
    m_held = std::exchange(other.m_held, false);
    m_type = other.m_type;
    return *this;
}

Access::~Access() {
    if (m_type == SHARE && m_held) {
        NamedSemaphore::release(m_semaphore, 1, nullptr);
    }
    NamedSemaphore::close(m_semaphore);
}

bool Access::take() {
    const std::uint32_t result = NamedSemaphore::take(m_semaphore);
    m_held = result == NamedSemaphore::taken;
    if (result == NamedSemaphore::abandoned) {
        HkMessageManager::debugStub("Wait Abandoned in Access.\n");
    } else if (!m_held && result != NamedSemaphore::timedOut) {
        HkMessageManager::debugStub("Invalid WaitForSingleObject result = 0x%lX.\n",
                                    static_cast<unsigned long>(result));
    }
    return m_held;
}

bool Access::giveBack() {
    if (NamedSemaphore::release(m_semaphore, 1, nullptr)) {
        return true;
    }
    const int error = NamedSemaphore::lastError();
    origin.report().issueStatus(" ReleaseSemaphore rc = %d.\n", error);
    return false;
}

bool Access::lock() {
    return take();
}

bool Access::unlock() {
    return std::exchange(m_held, false) && giveBack();
}

bool Access::cleanLock() {
    return giveBack();
}

int Access::incCount() {
    std::int32_t previous = 0;
    int count = 0;
    if (NamedSemaphore::release(m_semaphore, 1, &previous)) {
        count = previous + 1;
    } else {
        const int error = NamedSemaphore::lastError();
        origin.report().issueStatus(" Count ReleaseSemaphore rc = %d.\n", error);
    }
    HkMessageManager::debugStub(" Cable Client Count = %d.\n", clientSlots - count);
    return count;
}

int Access::decCount() {
    return take() ? 1 : 0;
}

int Access::getNormalizedCount() {
    std::int32_t free = 0;
    NamedSemaphore::count(m_semaphore, free);
    HkMessageManager::debugStub(" Cable Normalized Count = %d.\n", clientSlots - free);
    return clientSlots - free;
}

int Access::generatePortId(const char* portName, int port, ACCESS_TYPE type) {
    const char* const name = portName != nullptr ? portName : "";
    HkMessageManager::debugStub(type == COUNT ? " Generating id for %s, port %d. share type = COUNT\n"
                                              : " Generating id for %s, port %d. share type = SHARE\n",
                                name, port);
    const int base = type == COUNT ? countBase : shareBase;
    const Family* const family = findFamily(name);
    const int id = family != nullptr ? sumThatWraps(base + family->offset, port) : base;
    if (id == shareBase || id == countBase) {
        HkMessageManager::debugStub("Invalid port name: %s. shar type = %d.\n", name, type);
    }
    return id;
}
