#include "robotconfig/host/NetworkRegistry.h"

#include <cstring>
#include <string>

namespace {

/// Value of a hexadecimal digit, or -1.
int hexDigitValue(wchar_t c) {
  if (c >= L'0' && c <= L'9') return c - L'0';
  if (c >= L'a' && c <= L'f') return c - L'a' + 10;
  if (c >= L'A' && c <= L'F') return c - L'A' + 10;
  return -1;
}

/// Length of an "0x" or "0X" prefix at the start of a text: 2 or 0.
int hexPrefixLength(const CString &sText) {
  return (sText.GetAt(0) == L'0' && (sText.GetAt(1) == L'x' || sText.GetAt(1) == L'X')) ? 2 : 0;
}

/// Reads a decimal or "0x" hexadecimal number not above `nMax`; false (value
/// 0) for an empty text, a stray character or a value above `nMax`.
bool bReadUnsigned(const CString &sText, unsigned long long nMax, unsigned long long &nValue) {
  nValue = 0;
  const int nPrefix = hexPrefixLength(sText);
  const unsigned nBase = nPrefix ? 16 : 10;
  if (sText.GetLength() <= nPrefix) return false;
  unsigned long long n = 0;
  for (int i = nPrefix; i < sText.GetLength(); ++i) {
    const int nDigit = hexDigitValue(sText[i]);
    if (nDigit < 0 || unsigned(nDigit) >= nBase) return false;
    n = n * nBase + unsigned(nDigit);
    if (n > nMax) return false;
  }
  nValue = n;
  return true;
}

/// A name as the node registry keeps it.
Networking::TNodeName nodeNameFromText(const wchar_t *pzName, int nLength) {
  Networking::TNodeName name{};
  const std::string sBytes = CString(pzName, nLength).toUtf8();
  size_t nKeep = sBytes.size();
  if (nKeep > name.size() - 1) {
    nKeep = name.size() - 1;
    // Never keep the first bytes of a character without the rest.
    while (nKeep > 0 && (static_cast<unsigned char>(sBytes[nKeep]) & 0xC0) == 0x80) --nKeep;
  }
  std::memcpy(name.data(), sBytes.data(), nKeep);
  return name;
}

}  // namespace

Networking::CNetworks theNetworks;

namespace Networking {

CNodes theNodes;

void TNetwork::initializeEmpty() {
  sNetworkName.Empty();
  nNetworkNumber = kNoNetworkNumber;
  nChannel = 0;
  date = TDateField{0, 0};
}

int CNetworks::findNetworkIndex(const CString &sName, TNetwork *pFound) const {
  for (size_t i = 0; i < m_networks.size(); ++i) {
    if (m_networks[i].sNetworkName != sName) continue;
    if (pFound) *pFound = m_networks[i];
    return static_cast<int>(i);
  }
  return -1;
}

int CNetworks::findNetworkIndex(unsigned short nNumber, TNetwork *pFound) const {
  for (size_t i = 0; i < m_networks.size(); ++i) {
    if (m_networks[i].nNetworkNumber != nNumber) continue;
    if (pFound) *pFound = m_networks[i];
    return static_cast<int>(i);
  }
  return -1;
}

int CNetworks::addNetwork(const TNetwork &network, bool bReplaceSameName) {
  if (bReplaceSameName) {
    const int nIndex = findNetworkIndex(network.sNetworkName);
    if (nIndex >= 0) {
      m_networks[size_t(nIndex)] = network;
      return nIndex;
    }
  }
  m_networks.push_back(network);
  return getNumbOfNetworks() - 1;
}

const TNetwork *CNetworks::getNetwork(int nIndex) const {
  return (nIndex >= 0 && nIndex < getNumbOfNetworks()) ? &m_networks[size_t(nIndex)] : nullptr;
}

void TNode::initializeEmpty() {
  sNodeName.fill(0);
  nSerialNumber.fill(0);
  nNetworkNumber = kNoNetworkNumber;
  registers.fill(TNodeRegister{0, 0});
  nNumbOfRegisters = 0;
}

void TNode::setSerialNumber(const TNodeSerialNumber *pSerialNumber) {
  if (pSerialNumber) nSerialNumber = *pSerialNumber;
}

void TNode::setNodeName(const wchar_t *pzName, int nLength) { sNodeName = nodeNameFromText(pzName, nLength); }

void TNode::updateRegisterValue(TATCommands nCommand, long long nValue) {
  for (int i = 0; i < nNumbOfRegisters && i < kMaxNodeRegisters; ++i) {
    if (registers[size_t(i)].nCommand != nCommand) continue;
    registers[size_t(i)].nValue = nValue;
    return;
  }
  if (nNumbOfRegisters < 0 || nNumbOfRegisters >= kMaxNodeRegisters) return;
  registers[size_t(nNumbOfRegisters++)] = TNodeRegister{nCommand, nValue};
}

bool TNode::bHasRegister(TATCommands nCommand) const {
  for (int i = 0; i < nNumbOfRegisters && i < kMaxNodeRegisters; ++i)
    if (registers[size_t(i)].nCommand == nCommand) return true;
  return false;
}

THardwareVersions TNode::getHardwareVersion() const {
  for (int i = 0; i < nNumbOfRegisters && i < kMaxNodeRegisters; ++i)
    if (registers[size_t(i)].nCommand == kATHardwareVersion)
      return static_cast<THardwareVersions>(registers[size_t(i)].nValue);
  return 0;
}

TNodeIndices CNodes::findNodeIndex(const CString &sName) const {
  const TNodeName name = nodeNameFromText(sName.GetString(), sName.GetLength());
  for (size_t i = 0; i < m_nodes.size(); ++i)
    if (m_nodes[i].sNodeName == name) return static_cast<TNodeIndices>(i);
  return -1;
}

TNodeIndices CNodes::findNodeIndexBySerialNumber(const TNodeSerialNumber &nSerialNumber, TNode *pFound) const {
  for (size_t i = 0; i < m_nodes.size(); ++i) {
    if (m_nodes[i].nSerialNumber != nSerialNumber) continue;
    if (pFound) *pFound = m_nodes[i];
    return static_cast<TNodeIndices>(i);
  }
  return -1;
}

TNode *CNodes::getNode(TNodeIndices nIndex) {
  return (nIndex >= 0 && nIndex < getNumbOfNodes()) ? &m_nodes[size_t(nIndex)] : nullptr;
}

const TNode *CNodes::getNode(TNodeIndices nIndex) const {
  return (nIndex >= 0 && nIndex < getNumbOfNodes()) ? &m_nodes[size_t(nIndex)] : nullptr;
}

TNodeIndices CNodes::addOrUpdateNode(const TNode &node, bool bUpdateName, bool bUpdateNetwork) {
  const TNodeIndices nIndex = findNodeIndexBySerialNumber(node.nSerialNumber);
  TNode *pKnown = getNode(nIndex);
  if (!pKnown) {
    m_nodes.push_back(node);
    return getNumbOfNodes() - 1;
  }
  if (bUpdateName) pKnown->sNodeName = node.sNodeName;
  if (bUpdateNetwork) pKnown->nNetworkNumber = node.nNetworkNumber;
  for (int i = 0; i < node.nNumbOfRegisters && i < kMaxNodeRegisters; ++i)
    pKnown->updateRegisterValue(node.registers[size_t(i)].nCommand, node.registers[size_t(i)].nValue);
  return nIndex;
}

bool NodeSerialNumberFromCString(TNodeSerialNumber &nSerialNumber, const CString &sText) {
  nSerialNumber.fill(0);
  const int nPrefix = hexPrefixLength(sText);
  const int nDigits = sText.GetLength() - nPrefix;
  if (nDigits < 1 || nDigits > 2 * int(nSerialNumber.size())) return false;
  unsigned long long nValue = 0;
  for (int i = nPrefix; i < sText.GetLength(); ++i) {
    const int nDigit = hexDigitValue(sText[i]);
    if (nDigit < 0) return false;
    nValue = (nValue << 4) | unsigned(nDigit);
  }
  for (size_t i = nSerialNumber.size(); i-- > 0; nValue >>= 8) nSerialNumber[i] = static_cast<unsigned char>(nValue);
  return true;
}

void CStringFromNodeSerialNumber(CString &sText, const TNodeSerialNumber *pSerialNumber) {
  sText.Empty();
  const TNodeSerialNumber nSerialNumber = pSerialNumber ? *pSerialNumber : TNodeSerialNumber{};
  for (unsigned char nByte : nSerialNumber) sText.AppendFormat(L"%02X", unsigned(nByte));
}

void CStringFromNodeName(CString &sText, const TNodeName *pName) {
  sText.Empty();
  if (!pName) return;
  size_t nLength = 0;
  while (nLength < pName->size() && (*pName)[nLength] != 0) ++nLength;
  sText = CString::fromUtf8(std::string_view(pName->data(), nLength));
}

void clearRadioRegistries() {
  theNetworks.removeAllNetworks();
  theNodes.removeAllNodes();
}

}  // namespace Networking

bool NetworkNumberFromCString(unsigned short &nNumber, const CString &sText) {
  unsigned long long nValue = 0;
  const bool bOk = bReadUnsigned(sText, 0xFFFF, nValue);
  nNumber = static_cast<unsigned short>(nValue);
  return bOk;
}

void CStringFromNetworkNumber(CString &sText, unsigned short nNumber) { sText.Format(L"0x%04X", unsigned(nNumber)); }

bool ChannelNumberFromCString(unsigned char &nChannel, const CString &sText) {
  unsigned long long nValue = 0;
  const bool bOk = bReadUnsigned(sText, 0xFF, nValue);
  nChannel = static_cast<unsigned char>(nValue);
  return bOk;
}

void CStringFromChannelNumber(CString &sText, unsigned char nChannel) { sText.Format(L"0x%02X", unsigned(nChannel)); }

bool HardwareVersionFromCString(Networking::THardwareVersions &nVersion, const CString &sText) {
  unsigned long long nValue = 0;
  const bool bOk = bReadUnsigned(sText, 0xFFFFFFFFull, nValue);
  nVersion = static_cast<Networking::THardwareVersions>(static_cast<uint32_t>(nValue));
  return bOk;
}

void CStringFromHardwareVersion(CString &sText, Networking::THardwareVersions nVersion) {
  sText.Format(L"0x%04X", static_cast<uint32_t>(nVersion));
}
