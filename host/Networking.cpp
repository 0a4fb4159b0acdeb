#include "host/Networking.h"

namespace Networking {

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
  if (bDefined != o.bDefined || sNetworkName != o.sNetworkName || nChannel != o.nChannel ||
      nNetworkType != o.nNetworkType || date.nDate != o.date.nDate || date.nTime != o.date.nTime ||
      definitionLine != o.definitionLine || nNumbOfNodes != o.nNumbOfNodes || nNetworkNumber != o.nNetworkNumber ||
      nPrimaryNodeAddress != o.nPrimaryNodeAddress)
    return false;
  for (int i = 0; i < nNumbOfNodes && i < kMaxNodesInNetwork; ++i)
    if (!(nodes[size_t(i)] == o.nodes[size_t(i)])) return false;
  return true;
}

}  // namespace Networking
