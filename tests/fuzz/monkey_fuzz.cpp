// Turns bytes into what someone does with the whole program, and looks after every act whether all is well.

#include "../app/monkey.hpp"

extern "C" int LLVMFuzzerInitialize(int*, char***) {
    GTEST_FLAG_SET(break_on_failure, true);
    return 0;
}

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    std::size_t next = 0;
    const auto byte = [&] { return next < size ? data[next++] : std::uint8_t{0}; };
    quabble::Monkey monkey([&](int limit) {
        const int high = byte();
        return (limit <= 256 ? high : high * 256 + byte()) % limit;
    });
    while (next < size)
        monkey.actAndCheck();
    return 0;
}
