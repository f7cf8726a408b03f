// Sharing of docs/guides.md: two parties want one port. Here they are two objects; two processes see the same.

#include <TessalUtility.h>

#include <cstdio>

int main() {
    const int port = Access::generatePortId("COM", 17, Access::SHARE);
    Access first(port, Access::SHARE);
    Access second(port, Access::SHARE);
    std::printf("first takes the port: %s\n", first.lock() ? "yes" : "no");
    std::printf("second takes it, too: %s\n", second.lock() ? "yes" : "no");
    first.unlock();
    const bool isFree = second.lock();
    std::printf("second after the first has given it back: %s\n", isFree ? "yes" : "no");
    second.unlock();

    Access clients(Access::generatePortId("COM", 17, Access::COUNT), Access::COUNT);
    clients.decCount();
    clients.decCount();
    std::printf("clients attached: %d\n", clients.getNormalizedCount());
    clients.incCount();
    clients.incCount();
    return isFree ? 0 : 1;
}
