#include "robotconfig/host/Networking.h"

namespace Networking {

namespace {

struct TNetworkTypeWord {
  TNtwkType nType;
  const wchar_t *pzWord;
};

// The kinds of XBee network a program can belong to.
constexpr std::array<TNetworkTypeWord, 4> kNetworkTypeWords = {{
    {0, L"ntwkXBee802_15_4"},
    {1, L"ntwkXBeeZigBee"},
    {2, L"ntwkXBeeDigiMesh"},
    {3, L"ntwkXBeeWiFi"},
}};

}  // namespace

TNtwkType getNetworkType(const CString &sWord) {
  for (const TNetworkTypeWord &row : kNetworkTypeWords)
    if (sWord == row.pzWord) return row.nType;
  return -1;
}

const wchar_t *getNetworkTypeString(TNtwkType nType) {
  for (const TNetworkTypeWord &row : kNetworkTypeWords)
    if (row.nType == nType) return row.pzWord;
  return L"";
}

bool TNtwkNodeInfo::operator==(const TNtwkNodeInfo &o) const {
  return sNodeName == o.sNodeName && nSerialNumber == o.nSerialNumber && nHardwareVersion == o.nHardwareVersion &&
         date.nDate == o.date.nDate && date.nTime == o.date.nTime && definitionLine == o.definitionLine;
}

void CNtwkInfoFromPragmas::initializeEmpty() {
  bDefined = 0;
  sNetworkName.Empty();
  nChannel = 0;
  nNetworkType = 0;
  date = TDateField{0, 0};
  definitionLine = TLineNumber();
  nNumbOfNodes = 0;
  nodes.fill(TNtwkNodeInfo());
  nNetworkNumber = kNoNetworkNumber;
  nPrimaryNodeAddress.fill(0);
}

void CNtwkInfoFromPragmas::setPrimaryNodeAddress(const unsigned char (&address)[8]) {
  for (size_t i = 0; i < nPrimaryNodeAddress.size(); ++i) nPrimaryNodeAddress[i] = address[i];
}

void CNtwkInfoFromPragmas::getPrimaryNode(unsigned char (&address)[8]) const {
  for (size_t i = 0; i < nPrimaryNodeAddress.size(); ++i) address[i] = nPrimaryNodeAddress[i];
}

bool CNtwkInfoFromPragmas::operator==(const CNtwkInfoFromPragmas &o) const {
  return bDefined == o.bDefined && sNetworkName == o.sNetworkName && nChannel == o.nChannel &&
         nNetworkType == o.nNetworkType && date.nDate == o.date.nDate && date.nTime == o.date.nTime &&
         nNetworkNumber == o.nNetworkNumber && nPrimaryNodeAddress == o.nPrimaryNodeAddress;
}

}  // namespace Networking
