#include <curses.h>
#include <gtest/gtest.h>

#include <string>

#include "host/HykNicInfo.h"
#include "host/PortGroupInfo.h"
#include "render/MarkupLayout.h"
#include "toolkit/CarouselRadioItem.h"
#include "toolkit/InfoDialog.h"

namespace {

using namespace Tulk;

std::string Laid(const std::string& markup) {
  return LayOutMarkup(markup, 80, {});
}

TEST(InfoTypeTest, RowValuesAreShortenedAtTheirLimits) {
  struct Case {
    std::string name;
    std::string mac;
    std::string shownName;
    std::string shownMac;
  };
  const Case cases[] = {
      {"hyk012", "02:00:00:aa:bb:cc", "hyk012", "02:00:00:aa:bb:cc"},
      {"hyk0123", "02:00:00:aa:bb:cc:d", "hyk...", "02:00:00:aa:bb..."},
  };
  for (const Case& c : cases) {
    std::string row = Laid(HykNicInfo(c.name, c.mac, "vSwitch0", "Management Network").Row());
    EXPECT_EQ(row.substr(0, 8), c.shownName + std::string(8 - c.shownName.size(), ' '));
    EXPECT_EQ(row.substr(8, 19), c.shownMac + std::string(19 - c.shownMac.size(), ' '));
  }
}

TEST(InfoTypeTest, RowColumnsLineUpWithTheHeadingAfterItsTwoBlanks) {
  HykNicInfo nic("hyk0", "02:00:00:aa:bb:cc", "vSwitch0", "A portgroup far too long to fit");
  std::string heading = Laid(nic.Heading());
  std::string row = "  " + Laid(nic.Row());
  ASSERT_EQ(heading.size(), row.size());
  for (std::size_t column : {2u, 10u, 29u, 39u}) {
    EXPECT_NE(heading[column], ' ') << column;
    EXPECT_NE(row[column], ' ') << column;
    EXPECT_EQ(heading[column - 1], ' ');
    EXPECT_EQ(row[column - 1], ' ');
  }
  PortGroupInfo group("Management Network with a long name", "vSwitch0", "1", "4095");
  EXPECT_EQ(Laid(group.Heading()).size(), ("  " + Laid(group.Row())).size());
  EXPECT_EQ(Laid(group.Row()).substr(0, 20), "Management Netw...  ");
}

TEST(InfoTypeTest, CarouselStepsRoundTheEntriesAndLabelsTheCurrentOne) {
  CarouselRadioItem<PortGroupInfo, InfoDialog> item(
      {PortGroupInfo("A", "vSwitch0", "0", "0"), PortGroupInfo("B", "vSwitch1", "2", "10")});
  EXPECT_EQ(item.Current()->Name(), "A");
  EXPECT_EQ(item.Label().substr(0, 2), "< ");
  EXPECT_TRUE(item.HandleKey(KEY_LEFT, nullptr));
  EXPECT_EQ(item.Current()->Name(), "B");
  EXPECT_NE(item.Label().find("vSwitch1"), std::string::npos);
  EXPECT_TRUE(item.HandleKey(KEY_RIGHT, nullptr));
  EXPECT_EQ(item.Current()->Name(), "A");
  EXPECT_FALSE(item.HandleKey('x', nullptr));

  CarouselRadioItem<PortGroupInfo, InfoDialog> single({PortGroupInfo("A", "s", "0", "0")});
  EXPECT_EQ(single.Label().substr(0, 2), "  ");
  EXPECT_TRUE(single.HandleKey(KEY_RIGHT, nullptr));
  EXPECT_EQ(single.Current()->Name(), "A");

  CarouselRadioItem<HykNicInfo, InfoDialog> empty;
  EXPECT_EQ(empty.Current(), nullptr);
  EXPECT_EQ(empty.Label(), "");
  EXPECT_TRUE(empty.HandleKey('d', nullptr));
}

}  // namespace
