// SPDX-License-Identifier: Apache-2.0
#include "Cockpit/Rows/QuantityWords.h"

#include <algorithm>
#include <array>

namespace kelvasi::cockpit {

namespace {

struct Entry {
  const Quantity* quantity;
  std::string_view name;
  std::string_view meaning;
};

using namespace quantity;

constexpr std::array entries{
    // Levels and ratios.
    Entry{&rsrp, "RSRP", "Mean power of the resource elements that carry a cell's reference signals."},
    Entry{&rsrq, "RSRQ", "How much of all power in the cell's band its reference signals make up."},
    Entry{&rssi, "RSSI", "All power received in the channel, whoever sends it."},
    Entry{&rscp, "RSCP", "Power received of the cell's pilot channel after despreading."},
    Entry{&rscpLevel, "RSCP level", "Power of the pilot channel as reported, from 0 to 91, in parts of 256."},
    Entry{&ecno, "Ec/No", "Energy of a pilot chip over all power in the channel."},
    Entry{&ecio, "Ec/Io", "Energy of a pilot chip over all power in the channel."},
    Entry{&carrierToInterference, "C/I", "Power of the signal over that of everything that disturbs it."},
    Entry{&sir, "SIR", "Signal over interference in a time slot, as the handset counts it, from 0 to 255."},
    Entry{&rxlev, "RXLEV", "Received level as GSM reports it: 0 is -110 dBm or less, 63 is -48 dBm or more."},
    Entry{&rxqual, "RXQUAL", "Bit error rate as GSM reports it, from 0 for the best to 7 for the worst."},
    Entry{&rxPower, "receive power", "All power at the receiver, from its gain control."},
    Entry{&txPower, "transmit power", "The power that the handset sends with."},
    Entry{&srxlev, "Srxlev",
          "How far the cell's level lies above what it asks for; below 0 nobody may camp on it."},
    Entry{&c1, "C1", "Path loss criterion: above 0 the cell may be camped on."},
    Entry{&c2, "C2", "What cells are compared by for reselection, C1 with the network's offsets."},
    Entry{&ranking, "ranking value", "What cells are compared by for reselection."},
    Entry{&bler, "BLER",
          "Share of transport blocks received in error, in the steps of the standard's table."},
    Entry{&fer, "FER", "Share of frames received in error."},
    Entry{&dataRate, "data rate", "How much is carried in a second."},
    Entry{&frequencyOffset, "frequency offset", "How far the cell's carrier lies from the handset's."},
    Entry{&frameOffset, "frame offset", "When the cell's frames begin, beside the handset's own."},
    Entry{&sampleOffset, "sample offset", "When the cell's signal begins, in samples of the handset."},
    // Names of cells, channels, areas and networks.
    Entry{&arfcn, "ARFCN", "Number of a GSM channel; it stands for a frequency."},
    Entry{&uarfcn, "UARFCN", "Number of a UMTS channel; it stands for a frequency."},
    Entry{&earfcn, "E-ARFCN", "Number of an LTE channel; it stands for a band and a frequency."},
    Entry{&cdmaChannel, "channel",
          "Number of a CDMA channel; with the band class it stands for a frequency."},
    Entry{&bandClass, "band class", "The frequency band, as CDMA counts them."},
    Entry{&band, "band", "The frequency band, as the record counts them."},
    Entry{&eutraBand, "band", "The frequency band, as LTE counts them."},
    Entry{&bandInfo, "band", "The frequency band, as the telephony daemon counts them."},
    Entry{&bsic, "BSIC", "Base station identity code: tells GSM cells of one channel apart."},
    Entry{&ncc, "NCC", "Network colour code: the first half of the BSIC."},
    Entry{&bcc, "BCC", "Base station colour code: the second half of the BSIC."},
    Entry{&scramblingCode, "scrambling code", "Tells UMTS cells of one channel apart."},
    Entry{&cellParameter, "cell parameter identity", "Tells cells of one UTRA TDD channel apart."},
    Entry{&pci, "PCI", "Physical cell identity: tells LTE cells of one channel apart."},
    Entry{&pnOffset, "PN offset", "Where a CDMA cell's pilot begins: tells cells of one channel apart."},
    Entry{&cellId, "cell identity", "What the network calls the cell."},
    Entry{&baseId, "base station identity", "What the network calls the base station."},
    Entry{&lac, "LAC", "Location area: where the network looks for the handset to call it."},
    Entry{&rac, "RAC", "Routing area: a part of a location area, for packet data."},
    Entry{&tac, "TAC", "Tracking area: where the network looks for the handset."},
    Entry{&uraId, "URA identity", "The area in which the radio network looks for a connected handset."},
    Entry{&mcc, "MCC", "Mobile country code: the network's country."},
    Entry{&mnc, "MNC", "Mobile network code: which network of the country."},
    Entry{&sid, "SID", "System identity: the CDMA network."},
    Entry{&nid, "NID", "Network identity: a part of a CDMA network."},
    Entry{&packetZone, "packet zone", "The area of one packet data connection."},
    Entry{&uati24, "UATI", "The handset's address in EV-DO, its lower 24 bits."},
    Entry{&colorCode, "colour code", "The EV-DO subnet that the handset's address belongs to."},
    Entry{&channelId, "channel identity", "Number of a transport channel."},
    Entry{&processId, "process", "Number of a HARQ process."},
    Entry{&timeslot, "time slot", "Number of a time slot."},
    // States.
    Entry{&mmState, "MM state", "Where mobility management for calls stands."},
    Entry{&mmSubState, "MM substate", "What idle mobility management for calls is doing."},
    Entry{&gmmState, "GMM state", "Where mobility management for packet data stands."},
    Entry{&gmmSubState, "GMM substate", "What mobility management for packet data is doing."},
    Entry{&mmUpdateStatus, "location update", "How the last location update ended."},
    Entry{&gmmUpdateStatus, "GPRS update", "How the last routing area update ended."},
    Entry{&registrationState, "registration", "Whether the handset is registered."},
    Entry{&serviceType, "service", "Which service the network gives."},
    Entry{&plmnSelection, "network selection", "Who selects the network, the handset or its user."},
    Entry{&rrState, "RR state", "Where the radio connection of GSM stands."},
    Entry{&rrSubState, "RR substate", "What the radio connection of GSM is doing."},
    Entry{&rrStatus, "RR status", "How the radio connection of GSM is."},
    Entry{&rrMode, "RR mode", "What the radio connection of GSM is for."},
    Entry{&rrcState, "RRC state", "Where the radio connection stands."},
    Entry{&oneXState, "1x state", "Where the 1x connection stands."},
    Entry{&evdoState, "EV-DO state", "Where the EV-DO connection stands."},
    Entry{&evdoSession, "EV-DO session", "Where the EV-DO session stands."},
    Entry{&roaming, "roaming", "Whether the network is the handset's own."},
    Entry{&ciphering, "ciphering", "Whether the air interface is enciphered."},
    Entry{&dtx, "DTX", "Whether the sender rests in silence."},
    Entry{&access, "access", "Who may use the cell."},
    Entry{&accessRestrictions, "access restrictions", "Who may not use the cell."},
    Entry{&cellSet, "cell set", "Which set the cell is in: active, monitored or detected."},
    Entry{&rat, "RAT", "Radio access technology."},
    Entry{&flag, "flag", "Yes or no."},
    // Counts.
    Entry{&crcs, "CRCs", "Blocks received with a checksum."},
    Entry{&crcErrors, "CRC errors", "Blocks whose checksum was wrong."},
    Entry{&receivedBits, "received bits", "How many bits were received."},
    Entry{&newTransmissions, "new transmissions", "Blocks that were sent for the first time."},
    Entry{&blockErrors, "block errors", "Blocks that were received in error."},
    Entry{&subFrames, "subframes", "How many subframes this is about."},
    Entry{&antennas, "antennas", "How many antenna ports the cell sends with."},
    Entry{&quantity::count, "count", "How many."},
    Entry{&drxCycles, "DRX cycles", "For how many of its cycles the cell has been too weak."},
    // Parameters.
    Entry{&version, "version", "Which form of the record this is."},
    Entry{&bandwidth, "bandwidth", "Width of the channel, in resource blocks."},
    Entry{&priority, "priority", "How much the network prefers this carrier: the higher, the more."},
    Entry{&qrxlevmin, "Qrxlevmin", "The least level that the network asks for."},
    Entry{&pMax, "P-Max", "The most power that the cell allows a handset."},
    Entry{&ueTxPower, "largest transmit power", "The most power that the handset may send with."},
    Entry{&searchThreshold, "search threshold", "Below this level the handset looks for other cells."},
    Entry{&measurementRules, "measurement rules", "Which cells the handset measures."},
    Entry{&frameNumber, "frame number", "The cell's count of frames when this was measured."},
    Entry{&window, "window", "Over how many blocks this is counted."},
    Entry{&carriers, "carriers", "How many carriers are used together."},
    Entry{&hoppingSequence, "hopping sequence", "The order in which frequencies are hopped through."},
    Entry{&operatingMode, "operating mode", "How the network pages for calls and packet data together."},
    Entry{&cellOption, "cell option", "Something that the cell has set."},
    Entry{&drxTimer, "DRX timer", "How long the handset listens on before it saves power."},
    Entry{&protocolRevision, "protocol revision", "Which release of the standard is used."},
    // What a property list holds.
    Entry{&quantity::text, "text", ""},
    Entry{&integer, "number", ""},
    Entry{&real, "number", ""},
    Entry{&boolean, "yes or no", ""},
    Entry{&data, "data", ""},
    Entry{&date, "date", ""},
    Entry{&list, "empty list", ""},
    Entry{&group, "empty group", ""},
    Entry{&none, "", ""},
};

}  // namespace

QuantityWords wordsOf(const Quantity& asked) {
  const auto found = std::ranges::find(entries, &asked, &Entry::quantity);
  if (found == entries.end()) return {asked.id, ""};
  return {found->name, found->meaning};
}

}  // namespace kelvasi::cockpit
