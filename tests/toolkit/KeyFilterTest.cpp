// Which keys each input filter lets through, and the length limit of a
// field: the table of every filter against the keys that tell them apart.

#include "toolkit/KeyFilter.h"

#include <curses.h>
#include <gtest/gtest.h>

#include <string>

#include "include/Keys.h"
#include "toolkit/InputField.h"

namespace {

using namespace Tulk;

TEST(KeyFilterTest, EachFilterTakesItsCharactersAndEditingKeys) {
  // Probe keys, in this order; each filter's row marks what it takes.
  const std::string probes = "07aAfFgGz.:/,- _x{";
  struct Case {
    const KeyFilter* filter;
    const char* name;
    const char* takes;  // one mark per probe
  };
  const Case cases[] = {
      // 0 7 a A f F g G z . : / , -   _ x {
      {&kAnyText, "any", "111111111111111111"},
      {&kLoginText, "login", "111111111111111111"},
      {&kDigits, "digits", "110000000000000000"},
      {&kIpv4, "ipv4", "110000000100000000"},
      {&kDnsServer, "dns", "111111000110000000"},
      {&kIpv6Network, "ipv6", "111111000111000000"},
      {&kHostName, "hostname", "111111111100010010"},
      {&kSuffixes, "suffixes", "111111111100111010"},
  };
  for (const Case& c : cases) {
    for (std::size_t i = 0; i < probes.size(); ++i) {
      EXPECT_EQ(c.filter->Accepts(probes[i]), c.takes[i] == '1')
          << c.name << " and '" << probes[i] << "'";
    }
    for (int key : {KEY_LEFT, KEY_RIGHT, KEY_HOME, KEY_END, KEY_BACKSPACE}) {
      EXPECT_TRUE(c.filter->Accepts(key)) << c.name << " and key " << key;
    }
    const bool full = c.filter != &kLoginText;
    EXPECT_EQ(c.filter->Accepts(KEY_DC), full) << c.name;
    EXPECT_EQ(c.filter->Accepts(kKeyCtrlH), full) << c.name;
    for (int key : {kKeyEnter, kKeyEsc, kKeyTab, KEY_UP, KEY_DOWN, KEY_F(3), 0x7f, 0x80, 0xe9}) {
      EXPECT_FALSE(c.filter->Accepts(key)) << c.name << " and key " << key;
    }
  }
}

TEST(KeyFilterTest, ALimitedFieldRefusesTheNextCharacterButStillEdits) {
  InputField state = InputField::WithValue("1440");
  state.maxLength = 5;
  state = InputField::HandleKey(state, KEY_END);
  state = InputField::HandleKey(state, '0');
  state = InputField::HandleKey(state, '7');  // a sixth digit is not taken
  EXPECT_EQ(state.value, "14400");
  state = InputField::HandleKey(state, KEY_BACKSPACE);
  state = InputField::HandleKey(state, '9');
  EXPECT_EQ(state.value, "14409");
  // Pristine, the first key replaces the whole value, limit or not.
  state.pristine = true;
  state = InputField::HandleKey(state, '3');
  EXPECT_EQ(state.value, "3");
}

}  // namespace
