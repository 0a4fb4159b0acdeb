// Menu-button service: a drop-down button whose items come from a name table.
#pragma once

#include <vector>

#include "robotconfig/host/CString.h"
#include "robotconfig/host/DeviceCatalog.h"

/// A drop-down button of a setup dialog, filled from a name table.
class CDropDownButtonOfDeviceTypeMenuItem {
 public:
  struct TItem {
    int32_t nValue;
    CString sKeyword;
    CString sLabel;  ///< the label, or the keyword for rows without one
  };

  /// Fills the menu with the rows of `pTable` that belong to the current
  /// platform, whose hardware bits meet `nHWMask` (0 and -1 admit every row,
  /// and so does a row without hardware bits) and whose third-party bits meet
  /// `nThirdPartyMask`. `pzSelected` names the item to show as chosen (may be null).
  void initializeAndBuildDropDownMenu(const TDeviceTypeMenuItem *pTable, TSensorHWTypesMask nHWMask,
                                      const wchar_t *pzSelected, TThirdPartyHWMask nThirdPartyMask);

  const std::vector<TItem> &items() const { return m_items; }
  /// Index of the chosen item, -1 when none.
  int getSelectedIndex() const { return m_nSelected; }

 private:
  std::vector<TItem> m_items;
  int m_nSelected = -1;
};
