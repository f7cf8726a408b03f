// The locks between processes: taking and giving back, opening and closing, and the id of a port. Beside them what
// else locks between processes on this host, and each pair with four processes at it at once.
#include <fcntl.h>
#include <semaphore.h>
#include <strings.h>
#include <sys/file.h>
#include <sys/wait.h>
#include <unistd.h>

#include <csignal>
#include <cstdio>
#include <cstdlib>
#include <string>
#include <vector>

#include "Access.h"
#include "Item.h"

#if __has_include(<boost/interprocess/sync/named_semaphore.hpp>)
#include <boost/interprocess/sync/named_semaphore.hpp>
#define TESSAL_HAS_BOOST_INTERPROCESS
#endif

namespace {

constexpr int port = 987001;

/// A name that the processes of this run share: it is made of the number of the first one.
std::string ownName(const char* what) {
    static const pid_t first = ::getpid();
    return std::string("tessal_bench_") + what + std::to_string(first);
}

// Each pair is a class with the operation pair(), which is true if it got the lock and gave it back.

class AccessPair {
public:
    bool pair() { return m_access.lock() && m_access.unlock(); }

private:
    Access m_access{port, Access::SHARE};
};

class CountPair {
public:
    bool pair() { return m_access.decCount() == 1 && m_access.incCount() > 0; }

private:
    Access m_access{port, Access::COUNT};
};

/// With as many units as the Access beside it: among four processes, one unit is refused mostly, five never.
template <unsigned units>
class SemaphorePair {
public:
    SemaphorePair() : m_name("/" + ownName("sem")), m_semaphore(::sem_open(m_name.c_str(), O_CREAT, 0600, units)) {}
    ~SemaphorePair() {
        ::sem_close(m_semaphore);
        ::sem_unlink(m_name.c_str());
    }
    SemaphorePair(const SemaphorePair&) = delete;
    SemaphorePair& operator=(const SemaphorePair&) = delete;
    bool pair() { return ::sem_trywait(m_semaphore) == 0 && ::sem_post(m_semaphore) == 0; }

private:
    std::string m_name;
    sem_t* m_semaphore;
};

class LockFile {
public:
    LockFile() : m_path("/tmp/" + ownName("file")), m_file(::open(m_path.c_str(), O_RDWR | O_CREAT, 0600)) {}
    ~LockFile() {
        ::close(m_file);
        ::unlink(m_path.c_str());
    }
    LockFile(const LockFile&) = delete;
    LockFile& operator=(const LockFile&) = delete;

protected:
    int file() const { return m_file; }

private:
    std::string m_path;
    int m_file;
};

class FlockPair : LockFile {
public:
    bool pair() { return ::flock(file(), LOCK_EX | LOCK_NB) == 0 && ::flock(file(), LOCK_UN) == 0; }
};

class RecordLockPair : LockFile {
public:
    bool pair() { return set(F_WRLCK) && set(F_UNLCK); }

private:
    bool set(short type) {
        struct flock lock {};
        lock.l_type = type;
        lock.l_whence = SEEK_SET;
        lock.l_len = 1;
        return ::fcntl(file(), F_SETLK, &lock) == 0;
    }
};

#ifdef TESSAL_HAS_BOOST_INTERPROCESS
namespace bip = boost::interprocess;

template <unsigned units>
class BoostPair {
public:
    BoostPair() : m_name(ownName("boost")), m_semaphore(bip::open_or_create, m_name.c_str(), units) {}
    ~BoostPair() { bip::named_semaphore::remove(m_name.c_str()); }
    BoostPair(const BoostPair&) = delete;
    BoostPair& operator=(const BoostPair&) = delete;
    bool pair() {
        if (!m_semaphore.try_wait()) {
            return false;
        }
        m_semaphore.post();
        return true;
    }

private:
    std::string m_name;
    bip::named_semaphore m_semaphore;
};

void openBoost(benchmark::State& state) {
    const std::string name = ownName("boost_open");
    for (auto _ : state) {
        { const bip::named_semaphore semaphore(bip::open_or_create, name.c_str(), 1); }
        bip::named_semaphore::remove(name.c_str());
    }
}

const std::vector<Side> boostOpen = {{"boost named_semaphore", openBoost}};
#else
const std::vector<Side> boostOpen = {};
#endif

template <class Pair>
void alone(benchmark::State& state) {
    Pair lock;
    if (!lock.pair() || !lock.pair()) {
        state.SkipWithError("the lock cannot be taken");
        return;
    }
    for (auto _ : state) {
        benchmark::DoNotOptimize(lock.pair());
    }
}

/// This process is measured while three others do the same; what fails because another holds the lock counts too.
template <class Pair>
void amongFour(benchmark::State& state) {
    std::vector<pid_t> others;
    Pair first;  // before the others, so that they open what is there
    for (int i = 0; i < 3; ++i) {
        const pid_t child = ::fork();
        if (child == 0) {
            ::alarm(120);
            for (Pair lock;;) {
                benchmark::DoNotOptimize(lock.pair());
            }
        }
        others.push_back(child);
    }
    long got = 0;
    for (auto _ : state) {
        got += first.pair();
    }
    state.counters["got"] = static_cast<double>(got) / static_cast<double>(state.iterations());
    for (const pid_t child : others) {
        ::kill(child, SIGKILL);
        ::waitpid(child, nullptr, 0);
    }
}

/// Opens, locks, gives back and closes: what one tool run does. A named semaphore that is opened and closed alone never
/// touches its memory, so that its mapping costs no page fault and no flush of another processor's address cache.
template <class Pair>
void openUseAndClose(benchmark::State& state) {
    for (auto _ : state) {
        Pair lock;
        benchmark::DoNotOptimize(lock.pair());
    }
}

void openAccess(benchmark::State& state) {
    for (auto _ : state) {
        Access access(port + 1, Access::SHARE);
        benchmark::DoNotOptimize(access);
    }
}

void openSemaphore(benchmark::State& state) {
    const std::string name = "/" + ownName("open");
    for (auto _ : state) {
        ::sem_close(::sem_open(name.c_str(), O_CREAT | O_EXCL, 0600, 1));
        ::sem_unlink(name.c_str());
    }
}

const char* const portNames[] = {"LPT", "usb", "USB2", "COM"};

void idOurs(benchmark::State& state) {
    unsigned i = 0;
    for (auto _ : state) {
        const char* name = portNames[++i % 4];
        benchmark::DoNotOptimize(name);
        benchmark::DoNotOptimize(Access::generatePortId(name, 3, Access::SHARE));
    }
}

int ladder(const char* name, int number) {
    int id = 100;
    if (::strcasecmp(name, "LPT") == 0) {
        id += 20 + number;
    } else if (::strcasecmp(name, "USB") == 0) {
        id += 40 + number;
    } else if (::strcasecmp(name, "USB2") == 0) {
        id += 60 + number;
    } else if (::strcasecmp(name, "COM") == 0) {
        id += 80 + number;
    }
    return id;
}

void idByLadder(benchmark::State& state) {
    unsigned i = 0;
    for (auto _ : state) {
        const char* name = portNames[++i % 4];
        benchmark::DoNotOptimize(name);
        benchmark::DoNotOptimize(ladder(name, 3));
    }
}

void formattedLine(benchmark::State& state) {
    char line[128];
    unsigned i = 0;
    for (auto _ : state) {
        const char* name = portNames[++i % 4];
        benchmark::DoNotOptimize(name);
        benchmark::DoNotOptimize(std::snprintf(line, sizeof line, " Generating id for %s, port %d.\n", name, 3));
    }
}

bool idsAgree() {
    for (const char* const name : portNames) {
        if (Access::generatePortId(name, 3, Access::SHARE) != ladder(name, 3)) {
            std::fprintf(stderr, "port_id: the sides differ for %s\n", name);
            std::abort();
        }
    }
    return true;
}
[[maybe_unused]] const bool agreed = idsAgree();

#ifdef TESSAL_HAS_BOOST_INTERPROCESS
template <unsigned units>
std::vector<Side> boostAlone() {
    return {{"boost named_semaphore", alone<BoostPair<units>>}};
}

template <unsigned units>
std::vector<Side> boostAmongFour() {
    return {{"boost named_semaphore", amongFour<BoostPair<units>>}};
}

const std::vector<Side> boostOpenAndUse = {{"boost named_semaphore", openUseAndClose<BoostPair<1>>}};
#else
template <unsigned>
std::vector<Side> boostAlone() {
    return {};
}

template <unsigned>
std::vector<Side> boostAmongFour() {
    return {};
}

const std::vector<Side> boostOpenAndUse = {};
#endif

template <unsigned units>
constexpr Side semaphoreAlone{"sem_trywait, sem_post", alone<SemaphorePair<units>>};
template <unsigned units>
constexpr Side semaphoreAmongFour{"sem_trywait, sem_post", amongFour<SemaphorePair<units>>};

const RegisterItem items[] = {
    RegisterItem{{"lock_unlock", {"Access", alone<AccessPair>}, boostAlone<1>(), semaphoreAlone<1>, 1.20, 1.20}},
    RegisterItem{{"count_take_give", {"Access", alone<CountPair>}, boostAlone<5>(), semaphoreAlone<5>, 1.40, 1.40}},
    RegisterItem{{"lock_unlock_flock", {"Access", alone<AccessPair>}, {{"flock", alone<FlockPair>}}, {}, 1.0, 0}},
    RegisterItem{{"lock_unlock_record", {"Access", alone<AccessPair>}, {{"fcntl", alone<RecordLockPair>}}, {}, 1.0, 0}},
    RegisterItem{
        {"lock_unlock_4", {"Access", amongFour<AccessPair>}, boostAmongFour<1>(), semaphoreAmongFour<1>, 0, 0}},
    RegisterItem{
        {"count_take_give_4", {"Access", amongFour<CountPair>}, boostAmongFour<5>(), semaphoreAmongFour<5>, 0, 0}},
    RegisterItem{
        {"lock_unlock_4_flock", {"Access", amongFour<AccessPair>}, {{"flock", amongFour<FlockPair>}}, {}, 0, 0}},
    RegisterItem{
        {"lock_unlock_4_record", {"Access", amongFour<AccessPair>}, {{"fcntl", amongFour<RecordLockPair>}}, {}, 0, 0}},
    RegisterItem{
        {"lock_open_close", {"Access", openAccess}, boostOpen, {"sem_open, sem_unlink", openSemaphore}, 1.50, 1.50}},
    RegisterItem{{"lock_open_use_close",
                  {"Access", openUseAndClose<AccessPair>},
                  boostOpenAndUse,
                  {"sem_open, sem_unlink", openUseAndClose<SemaphorePair<1>>},
                  1.50,
                  1.50}},
    RegisterItem{{"port_id",
                  {"Access", idOurs},
                  {{"formatted line", formattedLine}},
                  {"compare ladder", idByLadder},
                  0.20,
                  2.00}},
};

}  // namespace
