// Starts the host, configured by QUIRE_TEST_HOST_VERSION ("none" for a host without a version),
// then runs the tests.
#include <gtest/gtest.h>

#include <cstdlib>
#include <string>

#include "test_host.h"

int main(int argc, char** argv) {
    testing::InitGoogleTest(&argc, argv);
    testhost::Config config;
    if (const char* version = std::getenv("QUIRE_TEST_HOST_VERSION")) {
        std::string text = version;
        if (text == "none") config.version.reset();
        else config.version = std::stod(text);
    }
    testhost::Host::start(config);
    return RUN_ALL_TESTS();
}
