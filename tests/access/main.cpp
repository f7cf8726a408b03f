#include <gtest/gtest.h>

#include "host/Role.h"

int main(int argc, char** argv) {
    Role::playIfAsked(argc, argv);
    testing::InitGoogleTest(&argc, argv);
    return RUN_ALL_TESTS();
}
