#include "robotconfig/host/MenuButton.h"

#include "robotconfig/host/Platform.h"

void CDropDownButtonOfDeviceTypeMenuItem::initializeAndBuildDropDownMenu(const TDeviceTypeMenuItem *pTable,
                                                                         TSensorHWTypesMask nHWMask,
                                                                         const wchar_t *pzSelected,
                                                                         TThirdPartyHWMask nThirdPartyMask) {
  m_items.clear();
  m_nSelected = -1;
  if (!pTable) return;
  const uint32_t nPlatformMask = pToggles ? pToggles->getPlatformMask() : 0;
  for (const TDeviceTypeMenuItem *pRow = pTable; pRow->nPlatformMask != 0; ++pRow) {
    if ((pRow->nPlatformMask & nPlatformMask) == 0) continue;
    if (pRow->nRowAttribute == kRowAttributeAlias) continue;  // a second keyword is no second item
    const bool bAnyHardware = nHWMask == 0 || nHWMask == -1 || pRow->nAttribute == 0;
    if (!bAnyHardware && (pRow->nAttribute & nHWMask) == 0) continue;
    if ((pRow->nThirdPartyMask & nThirdPartyMask) == 0) continue;
    const CString sKeyword(pRow->pzKeyword);
    if (pzSelected && sKeyword == pzSelected) m_nSelected = static_cast<int>(m_items.size());
    m_items.push_back({pRow->nValue, sKeyword, CString(pRow->pzLabel ? pRow->pzLabel : pRow->pzKeyword)});
  }
}
