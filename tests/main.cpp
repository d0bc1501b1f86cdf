// Runs the tests of a room in the language of the environment.

#include <gtest/gtest.h>

#include <clocale>
#include <cstdlib>
#include <iostream>

int main(int argc, char** argv) {
    ::testing::InitGoogleTest(&argc, argv);
    const char* const wanted = std::getenv("LC_ALL");
    const bool found = std::setlocale(LC_ALL, "") != nullptr;
    // A language that cannot be had would pass each test without a look at it.
    if (!found && wanted != nullptr && std::getenv("LOCPATH") != nullptr) {
        std::cerr << "the locale " << wanted << " was not found\n";
        return 1;
    }
    std::setlocale(LC_MESSAGES, "C");  // as the programs do
    return RUN_ALL_TESTS();
}
