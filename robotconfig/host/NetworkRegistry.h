// The radio registries: the IDE-wide lists of the XBee networks and radio
// nodes that the programs read so far have named, and the text forms of
// their numbers as configuration lines write them.
//
// Both registries live for the whole process and only grow while programs
// are read; a host (or a test) empties them with clearRadioRegistries().
#pragma once

#include <array>
#include <cstdint>
#include <vector>

#include "robotconfig/host/CString.h"
#include "robotconfig/host/HostMessages.h"
#include "robotconfig/host/Networking.h"

namespace Networking {

/// Index of a node in the node registry; negative = none.
typedef int32_t TNodeIndices;
/// A radio register, named by its two-character AT command (first character
/// in the high byte).
typedef uint16_t TATCommands;
/// The hardware-version register, "HV".
constexpr TATCommands kATHardwareVersion = 0x4856;
/// Bytes of a node name, its terminating zero included.
constexpr int kNodeNameSize = 32;
/// A node name as the registry keeps it: UTF-8, zero-terminated.
typedef std::array<char, kNodeNameSize> TNodeName;
/// Registers one node keeps.
constexpr int kMaxNodeRegisters = 8;

/// One known radio network.
struct TNetwork {
  CString sNetworkName;
  uint16_t nNetworkNumber;
  uint8_t nChannel;
  TDateField date;

  TNetwork() { initializeEmpty(); }
  /// No name, no network (number 0xFFFF), channel 0, no date.
  void initializeEmpty();
};

/// The radio-network registry.
class CNetworks {
 public:
  /// Index of the first network of that name (exact case), or -1; copies it
  /// into `pFound` when found and `pFound` is set.
  int findNetworkIndex(const CString &sName, TNetwork *pFound = nullptr) const;
  /// Index of the first network of that number, or -1; as above.
  int findNetworkIndex(unsigned short nNumber, TNetwork *pFound = nullptr) const;
  /// Registers a network and returns its index. With `bReplaceSameName` a
  /// network of the same name is replaced in place instead of added again.
  int addNetwork(const TNetwork &network, bool bReplaceSameName);
  int getNumbOfNetworks() const { return static_cast<int>(m_networks.size()); }
  /// The network at an index; null outside the registry.
  const TNetwork *getNetwork(int nIndex) const;
  void removeAllNetworks() { m_networks.clear(); }

 private:
  std::vector<TNetwork> m_networks;
};

/// One register value a node reported.
struct TNodeRegister {
  TATCommands nCommand;
  long long nValue;
};

/// One known radio node.
struct TNode {
  TNodeName sNodeName;
  TNodeSerialNumber nSerialNumber;
  uint16_t nNetworkNumber;
  std::array<TNodeRegister, kMaxNodeRegisters> registers;
  int32_t nNumbOfRegisters;

  TNode() { initializeEmpty(); }
  /// No name, serial number 0, no network (0xFFFF), no registers.
  void initializeEmpty();
  void setSerialNumber(const TNodeSerialNumber *pSerialNumber);
  /// Keeps the name as UTF-8, cut at a character boundary to fit 31 bytes.
  void setNodeName(const wchar_t *pzName, int nLength);
  /// Sets a register, adding it when new; a node whose register table is
  /// full ignores further new registers.
  void updateRegisterValue(TATCommands nCommand, long long nValue);
  /// Whether the node has reported that register.
  bool bHasRegister(TATCommands nCommand) const;
  /// The hardware-version register, 0 when it was never reported.
  THardwareVersions getHardwareVersion() const;
};

/// The radio-node registry. Nodes are indexed 0..count-1 in the order they
/// were registered.
class CNodes {
 public:
  /// Index of the first node of that name (as setNodeName would keep it), or -1.
  TNodeIndices findNodeIndex(const CString &sName) const;
  /// Index of the node with that serial number, or -1; copies it into `pFound`.
  TNodeIndices findNodeIndexBySerialNumber(const TNodeSerialNumber &nSerialNumber, TNode *pFound = nullptr) const;
  /// The node at an index; null outside the registry.
  TNode *getNode(TNodeIndices nIndex);
  const TNode *getNode(TNodeIndices nIndex) const;
  /// Registers a node, or updates the node with the same serial number: its
  /// registers always, its name when `bUpdateName`, its network number when
  /// `bUpdateNetwork`. Returns the node's index.
  TNodeIndices addOrUpdateNode(const TNode &node, bool bUpdateName, bool bUpdateNetwork);
  int getNumbOfNodes() const { return static_cast<int>(m_nodes.size()); }
  void removeAllNodes() { m_nodes.clear(); }

 private:
  std::vector<TNode> m_nodes;
};

/// The radio-node registry of the process.
extern CNodes theNodes;

/// Reads up to 16 hexadecimal digits (an "0x" prefix is allowed), most
/// significant byte first; false, with all bytes 0, for any other text.
bool NodeSerialNumberFromCString(TNodeSerialNumber &nSerialNumber, const CString &sText);
/// Writes the 16 upper-case hexadecimal digits of a serial number.
void CStringFromNodeSerialNumber(CString &sText, const TNodeSerialNumber *pSerialNumber);
/// A node name as text.
void CStringFromNodeName(CString &sText, const TNodeName *pName);

/// Empties the radio-network registry and the radio-node registry.
void clearRadioRegistries();

}  // namespace Networking

/// The radio-network registry of the process.
extern Networking::CNetworks theNetworks;

// Numbers are read as decimal or as "0x" hexadecimal and written as "0x"
// followed by upper-case hexadecimal digits. A reader returns false, with the
// value 0, for a text that is no number or does not fit.
bool NetworkNumberFromCString(unsigned short &nNumber, const CString &sText);
/// "0x" and four digits.
void CStringFromNetworkNumber(CString &sText, unsigned short nNumber);
bool ChannelNumberFromCString(unsigned char &nChannel, const CString &sText);
/// "0x" and two digits.
void CStringFromChannelNumber(CString &sText, unsigned char nChannel);
/// Any 32-bit pattern; a negative version is written as its unsigned pattern.
bool HardwareVersionFromCString(Networking::THardwareVersions &nVersion, const CString &sText);
/// "0x" and at least four digits.
void CStringFromHardwareVersion(CString &sText, Networking::THardwareVersions nVersion);
