// Network-definition service: the multi-robot network that one program's
// configuration belongs to.
#pragma once

#include <array>
#include <cstdint>

#include "robotconfig/host/CString.h"
#include "robotconfig/host/HostMessages.h"
#include "robotconfig/host/LineNumber.h"

namespace Networking {

typedef int32_t TNtwkType;          ///< network type, negative = none
typedef int32_t THardwareVersions;  ///< radio hardware version
/// The 8-byte address of an XBee radio, most significant byte first.
typedef std::array<unsigned char, 8> TNodeSerialNumber;

/// Most node entries one network definition keeps.
constexpr int kMaxNodesInNetwork = 9;
/// Network number of "no network".
constexpr uint16_t kNoNetworkNumber = 0xFFFF;

/// One radio node of a network definition.
struct TNtwkNodeInfo {
  CString sNodeName;
  TNodeSerialNumber nSerialNumber{};
  THardwareVersions nHardwareVersion = 0;
  TDateField date{0, 0};
  TLineNumber definitionLine;

  void setNodeName(const CString &sName) { sNodeName = sName; }
  bool operator==(const TNtwkNodeInfo &o) const;
};

/// The network definition read from a program's configuration lines.
class CNtwkInfoFromPragmas {
 public:
  CNtwkInfoFromPragmas() { initializeEmpty(); }

  /// Leaves no network: number 0xFFFF, no nodes, nothing defined.
  void initializeEmpty();
  void setNetworkName(const CString &sName) { sNetworkName = sName; }
  void setNetworkNumber(unsigned short nNumber) { nNetworkNumber = nNumber; }
  unsigned short getNetworkNumber() const { return nNetworkNumber; }
  void setPrimaryNodeAddress(const unsigned char (&address)[8]);
  void getPrimaryNode(unsigned char (&address)[8]) const;
  void setPrimaryNodeAddress(const TNodeSerialNumber &address) { nPrimaryNodeAddress = address; }
  void getPrimaryNode(TNodeSerialNumber &address) const { address = nPrimaryNodeAddress; }

  /// The same network definition: name, type, number, channel, date and
  /// primary node. The node entries and the line numbers record the program's
  /// lines, not settings: the node lines written come from the radio-node
  /// registry, and the same network on other lines is the same network.
  bool operator==(const CNtwkInfoFromPragmas &o) const;
  bool operator!=(const CNtwkInfoFromPragmas &o) const { return !(*this == o); }

  uint8_t bDefined = 0;
  CString sNetworkName;
  uint8_t nChannel = 0;
  TNtwkType nNetworkType = 0;
  TDateField date{0, 0};
  TLineNumber definitionLine;
  int32_t nNumbOfNodes = 0;
  std::array<TNtwkNodeInfo, kMaxNodesInNetwork> nodes;
  uint16_t nNetworkNumber = kNoNetworkNumber;
  TNodeSerialNumber nPrimaryNodeAddress{};
};

/// Network type of a type word (compared exactly, with case); negative when
/// the word names no network type.
TNtwkType getNetworkType(const CString &sWord);
/// The word of a network type, as getNetworkType accepts it; "" for a value
/// that names no network type.
const wchar_t *getNetworkTypeString(TNtwkType nType);

}  // namespace Networking
