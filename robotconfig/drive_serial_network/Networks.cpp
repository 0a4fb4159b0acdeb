// The multi-robot network lines: the program's NetworkDefinition line and one
// NetworkNode line per radio of the network. Reading registers networks and
// radios that the IDE does not know yet; writing takes channel, date, node
// names and hardware versions from those registries.
#include "robotconfig/core/ParameterText.h"
#include "robotconfig/core/RobotConfiguration.h"
#include "robotconfig/host/HostMessages.h"
#include "robotconfig/host/NetworkRegistry.h"
#include "robotconfig/host/Networking.h"

namespace {

// Parameters of a NetworkDefinition line.
constexpr size_t kDefinitionNetworkName = 1;
constexpr size_t kDefinitionPrimaryNode = 2;
constexpr size_t kDefinitionNetworkType = 3;
constexpr size_t kDefinitionNetworkNumber = 4;
constexpr size_t kDefinitionChannel = 5;
constexpr size_t kDefinitionSerialNumber = 6;
constexpr size_t kDefinitionDate = 7;

// Parameters of a NetworkNode line as a program may write it; the generated
// line leaves out the date, so there the hardware version is parameter 3.
constexpr size_t kNodeName = 1;
constexpr size_t kNodeSerialNumber = 2;
constexpr size_t kNodeDate = 3;
constexpr size_t kNodeHardwareVersion = 4;

/// Whether a text is a date, as DateFieldFromCString reads one.
bool bIsDate(const CString &sText) {
  TDateField date{0, 0};
  DateFieldFromCString(&date, &sText);
  return date.nDate != 0 || date.nTime != 0;
}

}  // namespace

bool CRobotConfigurationBasic::bParseConfigDefinitionLineNetworkDefinition(const TTokenizedConfigParms &parms, bool,
                                                                           TLineNumber line, CString &sError) {
  const CString &sNetworkName = parms.sParms[kDefinitionNetworkName];
  const CString &sPrimaryNode = parms.sParms[kDefinitionPrimaryNode];
  Networking::TNodeSerialNumber nSerialNumber{};
  Networking::NodeSerialNumberFromCString(nSerialNumber, parms.sParms[kDefinitionSerialNumber]);
  // The definition replaces any earlier one, also when the line then fails.
  pNtwkInfo->initializeEmpty();

  const Networking::TNtwkType nType = Networking::getNetworkType(parms.sParms[kDefinitionNetworkType]);
  if (nType < 0) {
    sError.Format(L"Invalid multi-robot network type '%s'", parms.sParms[kDefinitionNetworkType]);
    return false;
  }
  unsigned char nChannel = 0;
  ChannelNumberFromCString(nChannel, parms.sParms[kDefinitionChannel]);
  unsigned short nNumber = 0;
  NetworkNumberFromCString(nNumber, parms.sParms[kDefinitionNetworkNumber]);
  TDateField date{0, 0};
  DateFieldFromCString(&date, &parms.sParms[kDefinitionDate]);

  // A network the IDE knows by name keeps its number, channel and date.
  if (theNetworks.findNetworkIndex(sNetworkName) < 0) {
    Networking::TNetwork network;
    network.initializeEmpty();
    network.sNetworkName = sNetworkName;
    network.nNetworkNumber = nNumber;
    network.nChannel = nChannel;
    // The writer takes the date from the registry: without it the line's date would be lost.
    network.date = date;
    theNetworks.addNetwork(network, true);
  }

  pNtwkInfo->bDefined = 1;
  pNtwkInfo->setNetworkName(sNetworkName);
  pNtwkInfo->nChannel = nChannel;
  pNtwkInfo->setNetworkNumber(nNumber);
  pNtwkInfo->nNetworkType = nType;
  pNtwkInfo->date = date;
  pNtwkInfo->definitionLine = line;

  const Networking::TNode *pPrimary = Networking::theNodes.getNode(Networking::theNodes.findNodeIndex(sPrimaryNode));
  if (pPrimary) {
    pNtwkInfo->setPrimaryNodeAddress(pPrimary->nSerialNumber);
    return true;
  }
  Networking::TNode node;
  node.initializeEmpty();
  node.setSerialNumber(&nSerialNumber);
  node.setNodeName(sPrimaryNode.GetString(), sPrimaryNode.GetLength());
  node.nNetworkNumber = nNumber;
  Networking::theNodes.addOrUpdateNode(node, false, false);
  // The new radio is the primary node: without its address the writer could not name it.
  pNtwkInfo->setPrimaryNodeAddress(nSerialNumber);
  return true;
}

bool CRobotConfigurationBasic::bParseConfigDefinitionLineNetworkNode(const TTokenizedConfigParms &parms, bool,
                                                                     TLineNumber line, CString &) {
  const int nEntry = pNtwkInfo->nNumbOfNodes;
  if (nEntry < 0 || nEntry >= Networking::kMaxNodesInNetwork) return true;

  // The generated line has no date: a third parameter that is no date, with
  // nothing after it, is the hardware version.
  const bool bGeneratedForm =
      parms.sParms[kNodeHardwareVersion].IsEmpty() && !bIsDate(parms.sParms[kNodeDate]);
  const CString sNoDate;
  const CString &sDate = bGeneratedForm ? sNoDate : parms.sParms[kNodeDate];
  const CString &sHardwareVersion = bGeneratedForm ? parms.sParms[kNodeDate] : parms.sParms[kNodeHardwareVersion];

  Networking::TNtwkNodeInfo &entry = pNtwkInfo->nodes[size_t(nEntry)];
  entry.setNodeName(parms.sParms[kNodeName]);
  Networking::NodeSerialNumberFromCString(entry.nSerialNumber, parms.sParms[kNodeSerialNumber]);
  DateFieldFromCString(&entry.date, &sDate);
  HardwareVersionFromCString(entry.nHardwareVersion, sHardwareVersion);
  entry.definitionLine = line;
  pNtwkInfo->nNumbOfNodes = nEntry + 1;

  Networking::TNode *pKnown =
      Networking::theNodes.getNode(Networking::theNodes.findNodeIndexBySerialNumber(entry.nSerialNumber));
  if (pKnown) {
    // A radio registered by a definition line has not reported its hardware
    // version yet; without it the generated line would write 0.
    if (!pKnown->bHasRegister(Networking::kATHardwareVersion))
      pKnown->updateRegisterValue(Networking::kATHardwareVersion, static_cast<long long>(entry.nHardwareVersion));
    return true;
  }
  const CString &sName = parms.sParms[kNodeName];
  Networking::TNode node;
  node.initializeEmpty();
  node.setSerialNumber(&entry.nSerialNumber);
  node.setNodeName(sName.GetString(), sName.GetLength());
  node.nNetworkNumber = pNtwkInfo->getNetworkNumber();
  node.updateRegisterValue(Networking::kATHardwareVersion, static_cast<long long>(entry.nHardwareVersion));
  Networking::theNodes.addOrUpdateNode(node, false, false);
  return true;
}

bool CRobotConfigurationBasic::buildSourceCodeForMultiNetworks() {
  const unsigned short nNumber = pNtwkInfo->getNetworkNumber();
  if (nNumber == Networking::kNoNetworkNumber) return false;

  // Channel and date come from the registry; a network it does not know
  // keeps those of the definition itself.
  Networking::TNetwork network;
  if (theNetworks.findNetworkIndex(nNumber, &network) < 0) {
    network.nChannel = pNtwkInfo->nChannel;
    network.date = pNtwkInfo->date;
  }

  // The primary node's name comes from the registry, else from the
  // definition's own node entry with that address; failing both it is empty.
  Networking::TNodeSerialNumber nPrimaryAddress{};
  pNtwkInfo->getPrimaryNode(nPrimaryAddress);
  CString sPrimaryName;
  if (const Networking::TNode *pPrimary =
          Networking::theNodes.getNode(Networking::theNodes.findNodeIndexBySerialNumber(nPrimaryAddress))) {
    Networking::CStringFromNodeName(sPrimaryName, &pPrimary->sNodeName);
  } else {
    for (int n = 0; n < pNtwkInfo->nNumbOfNodes && n < Networking::kMaxNodesInNetwork; ++n) {
      const Networking::TNtwkNodeInfo &entry = pNtwkInfo->nodes[size_t(n)];
      if (entry.nSerialNumber != nPrimaryAddress) continue;
      sPrimaryName = entry.sNodeName;
      break;
    }
  }

  CString sNumber, sChannel, sSerialNumber, sDate, sLine;
  CStringFromNetworkNumber(sNumber, nNumber);
  CStringFromChannelNumber(sChannel, network.nChannel);
  Networking::CStringFromNodeSerialNumber(sSerialNumber, &nPrimaryAddress);
  CStringFromDateField(&sDate, &network.date);
  sLine.Format(L"#pragma config(%s, %s, %s, %s, %s, %s, %s, %s)",
               TConfigTypeDefns::getConfigTypeName(configTypeNetworkDefinition), textAsParameter(pNtwkInfo->sNetworkName),
               textAsParameter(sPrimaryName), textAsParameter(Networking::getNetworkTypeString(pNtwkInfo->nNetworkType)),
               sNumber, sChannel, sSerialNumber, textAsParameter(sDate));
  addSourceLineToConfiguration(sLine);

  CString sName, sVersion;
  for (int n = 0; n < Networking::theNodes.getNumbOfNodes(); ++n) {
    const Networking::TNode *pNode = Networking::theNodes.getNode(n);
    if (!pNode || pNode->nNetworkNumber != nNumber) continue;
    Networking::CStringFromNodeName(sName, &pNode->sNodeName);
    Networking::CStringFromNodeSerialNumber(sSerialNumber, &pNode->nSerialNumber);
    CStringFromHardwareVersion(sVersion, pNode->getHardwareVersion());
    sLine.Format(L"#pragma config(%s, %s, %s, %s)", TConfigTypeDefns::getConfigTypeName(configTypeNetworkNode),
                 textAsParameter(sName), sSerialNumber, sVersion);
    addSourceLineToConfiguration(sLine);
  }
  return true;
}
