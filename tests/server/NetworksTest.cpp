#include <gtest/gtest.h>

#include "server/Networks.h"

namespace zel {
namespace {

bool inside(const char* network, const char* address) {
    const auto range = networkOf(network);
    EXPECT_TRUE(range) << network;
    return range && mayConnect({*range}, address);
}

TEST(Networks, Range_HoldsItsAddresses) {
    EXPECT_TRUE(inside("192.168.1.0/24", "192.168.1.255"));
    EXPECT_FALSE(inside("192.168.1.0/24", "192.168.2.0"));
    EXPECT_TRUE(inside("10.1.2.3", "10.1.2.3"));
    EXPECT_FALSE(inside("10.1.2.3", "10.1.2.4"));
    EXPECT_TRUE(inside("0.0.0.0/0", "8.8.8.8"));
    EXPECT_FALSE(inside("0.0.0.0/0", "2001:db8::1"));
    EXPECT_TRUE(inside("2001:db8::/33", "2001:db8:7fff::1"));
    EXPECT_FALSE(inside("2001:db8::/33", "2001:db8:8000::1"));
}

TEST(Networks, OldAddressInTheNewForm_IsTheSame) {
    EXPECT_TRUE(inside("127.0.0.0/8", "::ffff:127.0.0.1"));
    EXPECT_TRUE(inside("::ffff:10.0.0.1", "10.0.0.1"));
}

TEST(Networks, LinkOfAnAddress_MakesNoDifference) {
    EXPECT_TRUE(inside("fe80::/10", "fe80::1%eth0"));
}

TEST(Networks, OtherTexts_AreNone) {
    for (const char* text :
         {"", "localhost", "1.2.3", "1.2.3.4.5", "256.1.1.1", "1.2.3.4/33", "1.2.3.4/", "::1/129",
          "1::2::3", "12345::", "1:2:3:4:5:6:7", "1:2:3:4:5:6:7:8:9", "1:", "1.2.3.-4", " ::1"})
        EXPECT_FALSE(networkOf(text)) << text;
}

TEST(Networks, NoList_IsLoopbackAndPrivateRanges) {
    const auto usual = networksOf(" ");
    ASSERT_TRUE(usual);
    for (const char* address : {"127.0.0.1", "::1", "10.200.1.1", "172.31.0.1", "192.168.9.9",
                                "169.254.1.1", "fd00::1", "fe80::2"})
        EXPECT_TRUE(mayConnect(*usual, address)) << address;
    for (const char* address : {"8.8.8.8", "172.32.0.1", "2001:db8::1", "", "host"})
        EXPECT_FALSE(mayConnect(*usual, address)) << address;
}

TEST(Networks, List_StandsInPlaceOfTheUsualOnes) {
    const auto list = networksOf("8.8.8.0/24, ::1;1.2.3.4");
    ASSERT_TRUE(list);
    EXPECT_EQ(list->size(), 3U);
    EXPECT_FALSE(mayConnect(*list, "127.0.0.1"));
    EXPECT_TRUE(mayConnect(*list, "1.2.3.4"));
    EXPECT_FALSE(networksOf("8.8.8.0/24 nonsense"));
    std::string many;
    for (int i = 0; i < 65; ++i) many += "1.2.3.4 ";
    EXPECT_FALSE(networksOf(many));
}

}  // namespace
}  // namespace zel
