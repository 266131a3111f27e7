#pragma once
/// "Migrate Hykernel NIC to Standard Switch": moves a kernel NIC to the
/// standard switch of a chosen portgroup.
///
/// 70 x 15, header 6 rows, footer "<Left/Right> Change  <D> Details ...
/// <Enter> OK  <Esc> Cancel". Items: the kernel NICs and the standard
/// switches' portgroups, each a carousel under its column heading
/// (Left/Right step through them, D shows the entry's details); the
/// management NIC is the NIC offered first.
///
/// Enter checks that both lists have an entry ("Invalid Argument" with the
/// dialog's own prompt, "Please choose which Hykernel NIC should be
/// migrated to which portgroup/switch.", or with "Please enter a valid
/// port group name."), then connects the NIC to the portgroup
/// (MigrateKernelNic()): "Operation Succeeded" naming the NIC and the
/// portgroup, and the form closes with 1; or "Operation Failed" with the
/// host's message and "Please check the syslog for more information.", and
/// the form stays open. Esc returns 0 and changes nothing.
///
/// Decisions of this implementation: everything above; the dialog is not
/// described further than the restore menu's entry. An empty list is
/// refused with the dialog's own prompt, the catalogue having no text of
/// its own for it.

#include "host/HykNicInfo.h"
#include "host/PortGroupInfo.h"
#include "toolkit/CarouselRadioItem.h"
#include "toolkit/FormDialog.h"
#include "toolkit/InfoDialog.h"

namespace Tulk {

class MigrateHyknicDialog : public FormDialog {
 public:
  static constexpr int kWidth = 70;
  static constexpr int kHeight = 15;
  static constexpr int kHeaderHeight = 6;

  /// The form above `owner` (the restore menu), listing the host's kernel
  /// NICs and portgroups.
  explicit MigrateHyknicDialog(Frame* owner);

 protected:
  bool OnKey(int key) override;
  bool Accept() override;

 private:
  using NicCarousel = CarouselRadioItem<HykNicInfo, InfoDialog>;
  using PortGroupCarousel = CarouselRadioItem<PortGroupInfo, InfoDialog>;

  NicCarousel* nics_ = nullptr;
  PortGroupCarousel* portGroups_ = nullptr;
};

}  // namespace Tulk
