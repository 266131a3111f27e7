#include "screens/WelcomeSummary.h"

#include <gtest/gtest.h>

#include "render/StringFactory.h"

namespace Tulk {
namespace {

StringFactory& Strings() {
  return *GetStringFactory("en_US");
}

struct HardwareCase {
  const char* vendor;
  const char* product;
  const char* line;
};

class HardwareLineTest : public ::testing::TestWithParam<HardwareCase> {};

TEST_P(HardwareLineTest, JoinsVendorAndProduct) {
  EXPECT_EQ(WelcomeSummary::HardwareLine(GetParam().vendor, GetParam().product), GetParam().line);
}

INSTANTIATE_TEST_SUITE_P(
    Vendors, HardwareLineTest,
    ::testing::Values(HardwareCase{"Acme", "Acme Server 9", "Acme Server 9"},
                      HardwareCase{"Acme Inc.", "Acme Server 9", "Acme Inc. Acme Server 9"},
                      // Stray firmware blanks are normalised before the prefix test.
                      HardwareCase{"  Acme\t ", "Acme   Server\n9  ", "Acme Server 9"},
                      HardwareCase{"Kestrel", "KX2200", "Kestrel KX2200"},
                      HardwareCase{"", "Server 9", "Server 9"},
                      // A plain prefix test, not a word test.
                      HardwareCase{"Acme", "AcmeCloud 2", "AcmeCloud 2"}));

struct MemoryCase {
  std::uint64_t bytes;
  const char* line;
};

class MemoryLineTest : public ::testing::TestWithParam<MemoryCase> {};

TEST_P(MemoryLineTest, RoundsToOneDecimalInTheLargestUnit) {
  EXPECT_EQ(WelcomeSummary::MemoryLine(GetParam().bytes), GetParam().line);
}

INSTANTIATE_TEST_SUITE_P(Sizes, MemoryLineTest,
                         ::testing::Values(MemoryCase{17179869184ULL, "16 GiB Memory"},
                                           MemoryCase{1610612736ULL, "1.5 GiB Memory"},
                                           MemoryCase{17072495001ULL, "15.9 GiB Memory"},
                                           MemoryCase{17179869184ULL - 1048576, "16 GiB Memory"},
                                           MemoryCase{536870912ULL, "512 MiB Memory"},
                                           // Just below 1 GiB stays in MiB.
                                           MemoryCase{1073741823ULL, "1024 MiB Memory"},
                                           MemoryCase{1099511627776ULL * 3 / 2, "1.5 TiB Memory"},
                                           // The unit table ends at P.
                                           MemoryCase{1125899906842624ULL * 2048,
                                                      "2048 PiB Memory"}));

std::vector<Ipv6Entry> Addresses(int count) {
  std::vector<Ipv6Entry> entries;
  for (int i = count; i > 0; --i) {
    entries.push_back({"2001:db8::" + std::to_string(i), 0});
  }
  return entries;
}

int CountLines(const std::string& text, std::string_view prefix) {
  int count = 0;
  for (std::size_t at = text.find(prefix); at != std::string::npos;
       at = text.find(prefix, at + 1)) {
    ++count;
  }
  return count;
}

TEST(WelcomeSummaryTest, TakesFourIpv6AddressesExceptExactlyFive) {
  const std::string four = WelcomeSummary::Ipv6Lines(Addresses(4), Strings());
  EXPECT_EQ(CountLines(four, "https://["), 4);
  EXPECT_EQ(four.find("..."), std::string::npos);

  const std::string five = WelcomeSummary::Ipv6Lines(Addresses(5), Strings());
  EXPECT_EQ(CountLines(five, "https://["), 5);
  EXPECT_EQ(five.find("..."), std::string::npos);

  // The first four in the host's order, sorted, then the ellipsis line.
  EXPECT_EQ(WelcomeSummary::Ipv6Lines(Addresses(6), Strings()),
            "https://[2001:db8::3]/ (STATIC)\n"
            "https://[2001:db8::4]/ (STATIC)\n"
            "https://[2001:db8::5]/ (STATIC)\n"
            "https://[2001:db8::6]/ (STATIC)\n"
            "...\n");
}

TEST(WelcomeSummaryTest, QualifiesIpv6AddressesByTypeAndSortsAsText) {
  EXPECT_EQ(
      WelcomeSummary::Ipv6Lines(
          {{"fe80::1", 1}, {"2001:db8::9", 9}, {"2001:db8::7", 7}, {"2001:db8::10", 0}}, Strings()),
      "https://[2001:db8::10]/ (STATIC)\n"
      "https://[2001:db8::7]/ (AUTOCONF)\n"
      "https://[2001:db8::9]/ (DHCP)\n"
      "https://[fe80::1]/ \n");
}

WelcomeFacts StaticHost() {
  WelcomeFacts facts;
  facts.hostname = "tavi-01";
  facts.ipv4Address = "10.0.0.5";
  facts.hasPhysicalNics = true;
  facts.kernelIpv6Enabled = true;
  facts.ipv6 = {{"2001:db8::5", 0}};
  return facts;
}

TEST(WelcomeSummaryTest, AddressBlockLines) {
  EXPECT_EQ(WelcomeSummary::AddressBlock(StaticHost(), Strings()),
            "To manage this host, go to:\n"
            "https://tavi-01/ \n"
            "https://10.0.0.5/ (STATIC)\n"
            "https://[2001:db8::5]/ (STATIC)\n");

  WelcomeFacts bare = StaticHost();
  bare.hostname = "localhost";
  bare.ipv4None = true;
  bare.kernelIpv6Enabled = false;
  EXPECT_EQ(WelcomeSummary::AddressBlock(bare, Strings()), "To manage this host, go to:");
  bare.hostname.clear();
  EXPECT_EQ(WelcomeSummary::AddressBlock(bare, Strings()), "To manage this host, go to:");

  WelcomeFacts noNics = StaticHost();
  noNics.hasPhysicalNics = false;
  EXPECT_EQ(WelcomeSummary::AddressBlock(noNics, Strings()), WelcomeSummary::kNoAdapterText);
}

TEST(WelcomeSummaryTest, DhcpQualifierAndWarnings) {
  WelcomeFacts facts = StaticHost();
  facts.kernelIpv6Enabled = false;
  EXPECT_EQ(WelcomeSummary::Warning(facts, Strings()), "");

  facts.dhcp = true;
  EXPECT_NE(WelcomeSummary::AddressBlock(facts, Strings()).find("https://10.0.0.5/ (DHCP)"),
            std::string::npos);
  EXPECT_EQ(WelcomeSummary::Warning(facts, Strings()), "");

  facts.ipv4Address = "0.0.0.0";
  EXPECT_NE(
      WelcomeSummary::AddressBlock(facts, Strings()).find("https://0.0.0.0/ (Waiting for DHCP...)"),
      std::string::npos);
  EXPECT_EQ(WelcomeSummary::Warning(facts, Strings()), Strings().GetString(142));

  facts.auditMode = true;
  EXPECT_EQ(WelcomeSummary::Warning(facts, Strings()), Strings().GetString(143));
}

TEST(WelcomeSummaryTest, ProcessorLineCountsPackagesFromTwo) {
  EXPECT_EQ(WelcomeSummary::ProcessorLine(1, " Helix  H6 "), "Helix H6");
  EXPECT_EQ(WelcomeSummary::ProcessorLine(0, "Helix H6"), "Helix H6");
  EXPECT_EQ(WelcomeSummary::ProcessorLine(2, "Helix   H6"), "2 x Helix H6");
}

}  // namespace
}  // namespace Tulk
