#include <gtest/gtest.h>

#include "NetworkTestSupport.h"

namespace {

using TulkTest::TestConsole;

TEST(NetworkExplore, Dump) {
  TestConsole console(NetworkTest::Options());
  ASSERT_TRUE(NetworkTest::OpenWindow(console));
  std::cout << console.Dump();
  for (const char* label : {"VLAN (optional)", "IPv4 Configuration", "IPv6 Configuration",
                            "DNS Configuration", "Custom DNS Suffixes"}) {
    ASSERT_TRUE(NetworkTest::Select(console, label));
    std::cout << console.Dump();
  }
  for (const auto& [label, title] : std::vector<std::pair<std::string, std::string>>{
           {"Network Adapters", "Select the adapters"},
           {"VLAN (optional)", "VLAN ID (1-4094"},
           {"IPv4 Configuration", "Set static IPv4"},
           {"IPv6 Configuration", "Use DHCPv6"},
           {"DNS Configuration", "Use the following DNS"},
           {"Custom DNS Suffixes", "Suffixes:"}}) {
    ASSERT_TRUE(NetworkTest::Select(console, label, true) ||
                NetworkTest::Select(console, label, false));
    console.Key("Enter");
    ASSERT_TRUE(TulkTest::Settled(console, title));
    std::cout << console.Dump();
    console.Key("Esc");
    ASSERT_TRUE(TulkTest::Gone(console, title));
  }
}

}  // namespace
