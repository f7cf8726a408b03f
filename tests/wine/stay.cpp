// Keeps one Wine process alive while the tests run: starting a program beside it takes a tenth of a second, where a
// first start takes some. Ends by itself after its bounded time.
#include <chrono>
#include <thread>

int main() {
    std::this_thread::sleep_for(std::chrono::minutes(10));
}
