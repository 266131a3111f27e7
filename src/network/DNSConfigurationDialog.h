#pragma once
/// "DNS Configuration": name servers and host name from DHCP, or given by
/// the operator.
///
/// A form 70 x 15 with a header of 6 rows. Items, in order: the radios
/// "Obtain DNS server addresses and a hostname automatically" and "Use the
/// following DNS server addresses and hostname:", then the inputs "Primary
/// DNS Server", "Alternate DNS Server" and "Hostname", pre-filled with the
/// pending values and enabled only while the second radio is marked. The
/// server inputs take ".", ":", the hexadecimal digits and the editing
/// keys; the host name input letters, digits, "-", "." and the editing
/// keys. The cursor shows only on the inputs. Footer "<Up/Down> Select
/// <Space> Mark Selected ... <Enter> OK  <Esc> Cancel".
///
/// Enter with the first radio marked: done at once, servers and host name
/// as they were (whatever the inputs hold). Otherwise the primary, then the
/// second server must be empty or an IPv4 or IPv6 address; the first that
/// is not shows "Invalid DNS server address" and gets the cursor. All
/// valid: the servers are kept in the host's own form (empty for none), the
/// host name as typed.
///
/// Decision of this implementation: while the second server's text has
/// three characters or more, its label is "IPv6 DNS Server" when the text
/// holds ":" and the primary server is an IPv4 address (the rule of the
/// window's description), else "Alternate DNS Server"; below three
/// characters it is always "Alternate DNS Server".

#include <string>

#include "toolkit/FormDialog.h"
#include "toolkit/RadioGroup.h"

namespace Tulk {

class DNSConfigurationDialog : public FormDialog {
 public:
  /// The dialog above `owner` for the pending values.
  DNSConfigurationDialog(Frame* owner, bool automatic, std::string primary, std::string alternate,
                         std::string hostname);

  /// After Enter: the new values.
  bool Automatic() const { return automatic_; }
  const std::string& Primary() const { return primary_; }
  const std::string& Alternate() const { return alternate_; }
  const std::string& Hostname() const { return hostname_; }

 protected:
  void Edited(InputItem& field) override;
  bool Accept() override;

 private:
  bool automatic_;
  std::string primary_;
  std::string alternate_;
  std::string hostname_;
  RadioGroup mode_;
  InputItem* primaryInput_;
  InputItem* alternateInput_;
  InputItem* hostnameInput_;
};

}  // namespace Tulk
