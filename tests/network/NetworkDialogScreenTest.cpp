// The management network's dialogs through the real console: the adapter
// list's order and details, and what each form takes, refuses and hands
// back to the window.

#include <gtest/gtest.h>

#include <algorithm>

#include "NetworkTestSupport.h"
#include "ScreenTestSupport.h"

namespace {

using namespace TulkTest;

// The pane rows that start with an adapter's name, in order.
std::vector<std::string> AdapterRows(TestConsole& console) {
  console.WaitReady();
  std::vector<std::string> names;
  for (const std::string& row : RightPane(console)) {
    if (row.rfind("hynic", 0) == 0) {
      names.push_back(row.substr(0, row.find(' ')));
    }
  }
  return names;
}

::testing::AssertionResult PaneShows(TestConsole& console, const std::string& row) {
  return console.WaitUntil(
      [&] {
        const std::vector<std::string> rows = RightPane(console);
        return std::find(rows.begin(), rows.end(), row) != rows.end();
      },
      "pane row " + row);
}

// Presses Enter in a form and waits for the message `title`, closes it
// and checks that the form is still open.
::testing::AssertionResult Refused(TestConsole& console, const std::string& title,
                                   const std::string& text, const std::string& form) {
  console.Key("Enter");
  if (auto shown = Settled(console, title); !shown) {
    return shown;
  }
  if (!console.Contains(text)) {
    return ::testing::AssertionFailure() << "no " << text << "\n" << console.Dump();
  }
  console.Key("Enter");
  if (auto closed = Gone(console, title); !closed) {
    return closed;
  }
  if (!console.Contains(form)) {
    return ::testing::AssertionFailure() << "the form closed\n" << console.Dump();
  }
  return ::testing::AssertionSuccess();
}

TEST(NetworkDialogScreenTest, AdaptersKeepTheMarkingOrderAndVlanIdsAreChecked) {
  TestConsole console(ConsoleOptions());
  ASSERT_TRUE(OpenWindow(console));
  {
    ASSERT_TRUE(OpenDialog(console, "Network Adapters", "Select the adapters"));
    console.Key("Space");  // hynic0 off
    console.Key("Down");
    console.Key("Space");  // hynic1 off
    console.Key("Down");
    console.Key("Space");  // hynic2 on
    console.Key("Up", 2);
    console.Key("Space");  // hynic0 on, after hynic2
    ASSERT_TRUE(Settled(console, "[X] hynic0"));
    console.Key("Enter");
    ASSERT_TRUE(Settled(console, "Remove these adapters from their current connections?"));
    // Esc: the list stays open with its marks.
    console.Key("Esc");
    ASSERT_TRUE(Gone(console, "Remove these adapters"));
    EXPECT_TRUE(console.Contains("[X] hynic2"));
    console.Key("Enter");
    ASSERT_TRUE(Settled(console, "Remove these adapters from their current connections?"));
    ASSERT_TRUE(CloseDialog(console, "Enter", "Select the adapters"));
    EXPECT_EQ(AdapterRows(console), (std::vector<std::string>{"hynic2", "hynic0"}));

    // Unmarking the middle one of three keeps the other two in order.
    ASSERT_TRUE(OpenDialog(console, "Network Adapters", "Select the adapters"));
    console.Key("Down");
    console.Key("Space");  // hynic1 on: hynic2, hynic0, hynic1
    console.Key("Up");
    console.Key("Space");  // hynic0 off
    ASSERT_TRUE(Settled(console, "[ ] hynic0"));
    // The details of the current row.
    console.Type("d");
    ASSERT_TRUE(Settled(console, "Adapter Details"));
    EXPECT_TRUE(console.Contains("Device Name: hynic0"));
    EXPECT_TRUE(console.Contains("Virtual Switch: vSwitch0"));
    ASSERT_TRUE(CloseDialog(console, "Enter", "Adapter Details"));
    console.Key("Enter");
    ASSERT_TRUE(Settled(console, "Remove these adapters"));
    ASSERT_TRUE(CloseDialog(console, "Enter", "Select the adapters"));
    EXPECT_EQ(AdapterRows(console), (std::vector<std::string>{"hynic2", "hynic1"}));

    // Esc leaves the pending list alone.
    ASSERT_TRUE(OpenDialog(console, "Network Adapters", "Select the adapters"));
    console.Key("Space");
    ASSERT_TRUE(CloseDialog(console, "Esc", "Select the adapters"));
    EXPECT_EQ(AdapterRows(console), (std::vector<std::string>{"hynic2", "hynic1"}));
  }
  {
    const char* kForm = "VLAN ID (1-4094";
    for (const char* typed : {"4096", "0"}) {
      ASSERT_TRUE(OpenDialog(console, "VLAN (optional)", kForm));
      console.Type(typed);
      EXPECT_TRUE(
          Refused(console, "Invalid VLAN ID", "Please reenter a valid VLAN ID (1-4095).", kForm))
          << typed;
      ASSERT_TRUE(CloseDialog(console, "Esc", kForm));
    }
    ASSERT_TRUE(OpenDialog(console, "VLAN (optional)", kForm));
    console.Type("4095");
    console.Key("Enter");
    ASSERT_TRUE(Settled(console, "You entered a VLAN ID of 4095."));
    ASSERT_TRUE(CloseDialog(console, "Enter", kForm));
    EXPECT_TRUE(PaneShows(console, "4095"));

    // Letters are never taken; an empty field is no VLAN.
    ASSERT_TRUE(OpenDialog(console, "VLAN (optional)", kForm));
    console.Type("1a2b");
    ASSERT_TRUE(CloseDialog(console, "Enter", kForm));
    EXPECT_TRUE(PaneShows(console, "12"));
    ASSERT_TRUE(OpenDialog(console, "VLAN (optional)", kForm));
    console.Key("Backspace");
    ASSERT_TRUE(CloseDialog(console, "Enter", kForm));
    EXPECT_TRUE(PaneShows(console, "Not set"));
  }
}

TEST(NetworkDialogScreenTest, DnsIpv4AndIpv6FormsCheckTheirInputsAndKeepTheirModes) {
  TestConsole console(ConsoleOptions());
  ASSERT_TRUE(OpenWindow(console));
  {
    const char* kForm = "Use the following DNS";
    ASSERT_TRUE(OpenDialog(console, "DNS Configuration", kForm));
    console.Key("Down", 3);
    console.Type("2001:db8::53");
    EXPECT_TRUE(console.WaitUntil(
        [&] {
          const int row = RowOf(console, "[ 2001:db8::53");
          return row >= 0 && console.Row(row).find("IPv6 DNS Server") != std::string::npos;
        },
        "the second server labelled as IPv6"));
    console.Key("Down");
    console.Type("my_host");
    EXPECT_TRUE(Settled(console, "[ myhost "));
    console.Key("Up", 2);
    console.Type("10.20.30.300");
    EXPECT_TRUE(Refused(console, "Invalid DNS server address",
                        "Please reenter a valid DNS server address", kForm));
    console.Key("Backspace", 2);
    ASSERT_TRUE(CloseDialog(console, "Enter", kForm));
    EXPECT_TRUE(PaneShows(console, "IPv6 DNS Server:"));
    EXPECT_TRUE(PaneShows(console, "10.20.30.3"));
    EXPECT_TRUE(PaneShows(console, "myhost"));

    // Both servers empty.
    ASSERT_TRUE(OpenDialog(console, "DNS Configuration", kForm));
    console.Key("Down", 2);
    console.Key("Backspace");
    console.Key("Down");
    console.Key("Backspace");
    ASSERT_TRUE(CloseDialog(console, "Enter", kForm));
    EXPECT_TRUE(PaneShows(console, "Alternate DNS Server:"));
    const std::vector<std::string> rows = RightPane(console);
    EXPECT_EQ(std::count(rows.begin(), rows.end(), "Not set"), 2);

    // Automatic accepts whatever stands in the inputs.
    ASSERT_TRUE(OpenDialog(console, "DNS Configuration", kForm));
    console.Key("Down", 2);
    console.Type("1.2.3");
    console.Key("Up", 2);
    console.Key("Space");
    ASSERT_TRUE(Settled(console, "(o) Obtain DNS server"));
    ASSERT_TRUE(CloseDialog(console, "Enter", kForm));
    EXPECT_TRUE(PaneShows(console, "Automatic"));

    // Suffixes are kept as typed and shown as names.
    ASSERT_TRUE(OpenDialog(console, "Custom DNS Suffixes", "Suffixes:"));
    console.Type("a.example,b.example  c_example");
    ASSERT_TRUE(CloseDialog(console, "Enter", "Suffixes:"));
    EXPECT_TRUE(PaneShows(console, "a.example, b.example, cexample"));
    ASSERT_TRUE(OpenDialog(console, "Custom DNS Suffixes", "Suffixes:"));
    EXPECT_TRUE(console.Contains("[ a.example,b.example  cexample "));
    ASSERT_TRUE(CloseDialog(console, "Esc", "Suffixes:"));
  }
  {
    const char* kForm = "Set static IPv4";
    struct Case {
      int down;
      const char* typed;
      const char* title;
      const char* text;
    };
    const Case cases[] = {
        {5, "", "Invalid gateway address", "Please reenter a valid gateway address (x.x.x.x)."},
        {4, "255.0.255.0", "Invalid subnet", "Please reenter a valid subnet (x.x.x.x)."},
        {3, "10.20.30", "Invalid IP address", "Please reenter a valid IPv4 address (x.x.x.x)."},
    };
    for (const Case& c : cases) {
      ASSERT_TRUE(OpenDialog(console, "IPv4 Configuration", kForm));
      console.Key("Down", c.down);
      console.Key("Backspace");
      console.Type(c.typed);
      EXPECT_TRUE(Refused(console, c.title, c.text, kForm)) << c.title;
      EXPECT_EQ(console.Cursor().row, 12 + c.down) << "the cursor in the refused input";
      ASSERT_TRUE(CloseDialog(console, "Esc", kForm));
    }

    // Letters are ignored.
    ASSERT_TRUE(OpenDialog(console, "IPv4 Configuration", kForm));
    console.Key("Down", 3);
    console.Type("10.2x0.30.7q");
    EXPECT_TRUE(Settled(console, "[ 10.20.30.7 "));
    ASSERT_TRUE(CloseDialog(console, "Esc", kForm));

    // DHCP clears the gateway only.
    ASSERT_TRUE(OpenDialog(console, "IPv4 Configuration", kForm));
    console.Key("Down");
    console.Key("Space");
    ASSERT_TRUE(Settled(console, "(o) Use dynamic IPv4"));
    ASSERT_TRUE(CloseDialog(console, "Enter", kForm));
    EXPECT_TRUE(PaneShows(console, "Automatic"));
    EXPECT_TRUE(PaneShows(console, "IPv4 Address: 10.20.30.41"));
    EXPECT_TRUE(PaneShows(console, "Subnet Mask: 255.255.255.0"));
    EXPECT_TRUE(PaneShows(console, "Default Gateway: Not set"));
  }
  {
    const char* kForm = "Use DHCPv6";
    struct Case {
      const char* typed;
      const char* title;
      const char* text;
    };
    const Case cases[] = {
        {"fe80::5/64", "Invalid scope", "Cannot add a link-local address as static address."},
        {"2001:db8::5", "Invalid IP address", "Please reenter a valid IPv6 network address"},
    };
    for (const Case& c : cases) {
      ASSERT_TRUE(OpenDialog(console, "IPv6 Configuration", kForm));
      console.Key("Down", 3);
      console.Key("Space");
      ASSERT_TRUE(Settled(console, "(o) Set static IPv6"));
      console.Key("Down", 2);
      console.Type(c.typed);
      EXPECT_TRUE(Refused(console, c.title, c.text, kForm)) << c.typed;
      ASSERT_TRUE(CloseDialog(console, "Esc", kForm));
    }

    // "Use DHCPv6" twice returns to router advertisement.
    ASSERT_TRUE(OpenDialog(console, "IPv6 Configuration", kForm));
    console.Key("Down", 2);
    console.Key("Space");
    ASSERT_TRUE(Settled(console, "[X] Use DHCPv6"));
    console.Key("Space");
    ASSERT_TRUE(Settled(console, "[ ] Use DHCPv6"));
    ASSERT_TRUE(CloseDialog(console, "Enter", kForm));
    EXPECT_TRUE(PaneShows(console, "Automatic (Router advertised)"));
    ASSERT_TRUE(OpenDialog(console, "IPv6 Configuration", kForm));
    console.Key("Down", 2);
    console.Key("Space");
    ASSERT_TRUE(Settled(console, "[X] Use DHCPv6"));
    ASSERT_TRUE(CloseDialog(console, "Enter", kForm));
    EXPECT_TRUE(PaneShows(console, "Automatic (DHCP)"));

    // IPv6 off: Enter does not look at the inputs.
    ASSERT_TRUE(OpenDialog(console, "IPv6 Configuration", kForm));
    console.Key("Down", 3);
    console.Key("Space");
    ASSERT_TRUE(Settled(console, "(o) Set static IPv6"));
    console.Key("Down");
    console.Type("fe80::5/64");
    console.Key("Up", 4);
    console.Key("Space");
    ASSERT_TRUE(Settled(console, "[X] Disable IPv6"));
    ASSERT_TRUE(CloseDialog(console, "Enter", kForm));
    EXPECT_TRUE(PaneShows(console, "IPv6 is disabled."));
  }
}

}  // namespace
