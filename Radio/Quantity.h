// SPDX-License-Identifier: Apache-2.0
// What a number of a record is: the closed list of quantities, each with its true unit whatever a row of the
// display shows beside it.
//
// To add one: add its line below and to `all`. Identifiers are for scripts and stay as they are.
#pragma once

#include <algorithm>
#include <array>
#include <string_view>

namespace kelvasi {

enum class QuantityKind {
  measurement,  // measured, on a scale with a unit
  identity,     // a name that happens to be a number: of a cell, a channel, an area, a network
  state,        // one of a list
  count,        // how many
  parameter,    // what the network or the record's maker has set
  text,         // no number
  container,    // an empty list or group
  none,         // its row says why
};

struct Quantity {
  std::string_view id;
  std::string_view unit;  // empty where the number has none
  QuantityKind kind = QuantityKind::none;
  double least = 0;  // of the values that the source allows; what a record holds may lie outside
  double most = 0;
  std::string_view source;  // the clause that defines it; empty where no standard does
};

namespace quantity {

using Kind = QuantityKind;

// Levels and ratios.
inline constexpr Quantity rsrp{"rsrp", "dBm", Kind::measurement, -140, -44, "3GPP TS 36.214, 5.1.1"};
inline constexpr Quantity rsrq{"rsrq", "dB", Kind::measurement, -30, 2.5, "3GPP TS 36.214, 5.1.3"};
inline constexpr Quantity rssi{"rssi", "dBm", Kind::measurement, -140, 0, "3GPP TS 36.214, 5.1.3"};
inline constexpr Quantity rscp{"rscp", "dBm", Kind::measurement, -121, -24, "3GPP TS 25.215, 5.1.1"};
inline constexpr Quantity rscpLevel{"rscp_level", "", Kind::measurement, 0, 1, "3GPP TS 25.123, 9.1.1.1"};
inline constexpr Quantity ecno{"ecno", "dB", Kind::measurement, -31, 0, "3GPP TS 25.215, 5.1.5"};
inline constexpr Quantity ecio{"ecio", "dB", Kind::measurement, -50, 0, "3GPP2 C.S0005, 2.6.6.2.2"};
inline constexpr Quantity carrierToInterference{"c_to_i", "dB", Kind::measurement, -30, 30, ""};
inline constexpr Quantity sir{"sir", "", Kind::measurement, 0, 255, "3GPP TS 25.225, 5.1.5"};
inline constexpr Quantity rxlev{"rxlev", "", Kind::measurement, 0, 63, "3GPP TS 45.008, 8.1.4"};
inline constexpr Quantity rxqual{"rxqual", "", Kind::measurement, 0, 7, "3GPP TS 45.008, 8.2.4"};
inline constexpr Quantity rxPower{"rx_power", "dBm", Kind::measurement, -128, 0, ""};
inline constexpr Quantity txPower{"tx_power", "dBm", Kind::measurement, -80, 33, ""};
inline constexpr Quantity srxlev{"srxlev", "dB", Kind::measurement, -30, 97, "3GPP TS 36.304, 5.2.3.2"};
inline constexpr Quantity c1{"c1", "dB", Kind::measurement, -128, 127, "3GPP TS 45.008, 6.4"};
inline constexpr Quantity c2{"c2", "dB", Kind::measurement, -128, 127, "3GPP TS 45.008, 6.4"};
inline constexpr Quantity ranking{"ranking", "dB", Kind::measurement, -200, 200, "3GPP TS 25.304, 5.2.6.1.4"};
inline constexpr Quantity bler{"bler", "", Kind::measurement, 0, 63, "3GPP TS 25.123, 9.1.4"};
inline constexpr Quantity fer{"fer", "%", Kind::measurement, 0, 100, ""};
inline constexpr Quantity dataRate{"data_rate", "kbit/s", Kind::measurement, 0, 5000, ""};
inline constexpr Quantity frequencyOffset{"frequency_offset", "", Kind::measurement, 0, 65535, ""};
inline constexpr Quantity frameOffset{"frame_offset", "", Kind::measurement, 0, 2047, ""};
inline constexpr Quantity sampleOffset{"sample_offset", "", Kind::measurement, 0, 524287, ""};

// Names of cells, channels, areas and networks.
inline constexpr Quantity arfcn{"arfcn", "", Kind::identity, 0, 1023, "3GPP TS 45.005, 2"};
inline constexpr Quantity uarfcn{"uarfcn", "", Kind::identity, 0, 16383, "3GPP TS 25.101, 5.4"};
inline constexpr Quantity earfcn{"earfcn", "", Kind::identity, 0, 262143, "3GPP TS 36.101, 5.7.3"};
inline constexpr Quantity cdmaChannel{"cdma_channel", "", Kind::identity, 0, 2047, "3GPP2 C.S0057"};
inline constexpr Quantity bandClass{"band_class", "", Kind::identity, 0, 31, "3GPP2 C.S0057"};
inline constexpr Quantity band{"band", "", Kind::identity, 0, 255, ""};
inline constexpr Quantity eutraBand{"eutra_band", "", Kind::identity, 1, 256, "3GPP TS 36.101, 5.5"};
inline constexpr Quantity bandInfo{"band_info", "", Kind::identity, 0, 2147483647, ""};
inline constexpr Quantity bsic{"bsic", "", Kind::identity, 0, 63, "3GPP TS 23.003, 4.3.2"};
inline constexpr Quantity ncc{"ncc", "", Kind::identity, 0, 7, "3GPP TS 23.003, 4.3.2"};
inline constexpr Quantity bcc{"bcc", "", Kind::identity, 0, 7, "3GPP TS 23.003, 4.3.2"};
inline constexpr Quantity scramblingCode{"scrambling_code",      "", Kind::identity, 0, 8191,
                                         "3GPP TS 25.213, 5.2.2"};
inline constexpr Quantity cellParameter{"cell_parameter", "", Kind::identity, 0, 127, "3GPP TS 25.223, 6.4"};
inline constexpr Quantity pci{"pci", "", Kind::identity, 0, 503, "3GPP TS 36.211, 6.11"};
inline constexpr Quantity pnOffset{"pn_offset", "64 chips", Kind::identity, 0, 511, "3GPP2 C.S0002"};
inline constexpr Quantity cellId{"cell_id", "", Kind::identity, 0, 268435455, "3GPP TS 23.003, 4.3.1, 19.6"};
inline constexpr Quantity baseId{"base_id", "", Kind::identity, 0, 65535, "3GPP2 C.S0005"};
inline constexpr Quantity lac{"lac", "", Kind::identity, 0, 65535, "3GPP TS 23.003, 4.1"};
inline constexpr Quantity rac{"rac", "", Kind::identity, 0, 255, "3GPP TS 23.003, 4.2"};
inline constexpr Quantity tac{"tac", "", Kind::identity, 0, 65535, "3GPP TS 23.003, 19.4.2.3"};
inline constexpr Quantity uraId{"ura_id", "", Kind::identity, 0, 65535, "3GPP TS 25.331, 10.3.2.6"};
inline constexpr Quantity mcc{"mcc", "", Kind::identity, 0, 999, "3GPP TS 23.003, 2.2"};
inline constexpr Quantity mnc{"mnc", "", Kind::identity, 0, 999, "3GPP TS 23.003, 2.2"};
inline constexpr Quantity sid{"sid", "", Kind::identity, 0, 32767, "3GPP2 C.S0005"};
inline constexpr Quantity nid{"nid", "", Kind::identity, 0, 65535, "3GPP2 C.S0005"};
inline constexpr Quantity packetZone{"packet_zone", "", Kind::identity, 0, 255, "3GPP2 C.S0005"};
inline constexpr Quantity uati24{"uati24", "", Kind::identity, 0, 16777215, "3GPP2 C.S0024"};
inline constexpr Quantity colorCode{"color_code", "", Kind::identity, 0, 255, "3GPP2 C.S0024"};
inline constexpr Quantity channelId{"channel_id", "", Kind::identity, 0, 255, ""};
inline constexpr Quantity processId{"process_id", "", Kind::identity, 0, 255, "3GPP TS 25.321, 4.2.3"};
inline constexpr Quantity timeslot{"timeslot", "", Kind::identity, 0, 6, "3GPP TS 25.221"};

// States.
inline constexpr Quantity mmState{"mm_state", "", Kind::state, 0, 25, "3GPP TS 24.008, 4.1.2.1"};
inline constexpr Quantity mmSubState{"mm_sub_state", "", Kind::state, 0, 8, "3GPP TS 24.008, 4.1.2.1"};
inline constexpr Quantity gmmState{"gmm_state", "", Kind::state, 0, 6, "3GPP TS 24.008, 4.1.3.1"};
inline constexpr Quantity gmmSubState{"gmm_sub_state", "", Kind::state, 0, 12, "3GPP TS 24.008, 4.1.3.1"};
inline constexpr Quantity mmUpdateStatus{"mm_update_status",       "", Kind::state, 0, 3,
                                         "3GPP TS 24.008, 4.1.2.2"};
inline constexpr Quantity gmmUpdateStatus{"gmm_update_status",      "", Kind::state, 0, 3,
                                          "3GPP TS 24.008, 4.1.3.2"};
inline constexpr Quantity registrationState{"registration_state", "", Kind::state, 0, 6, ""};
inline constexpr Quantity serviceType{"service_type", "", Kind::state, 0, 4, ""};
inline constexpr Quantity plmnSelection{"plmn_selection", "", Kind::state, 0, 4, "3GPP TS 23.122, 4.4.3"};
inline constexpr Quantity rrState{"rr_state", "", Kind::state, 0, 21, "3GPP TS 44.018"};
inline constexpr Quantity rrSubState{"rr_sub_state", "", Kind::state, 0, 255, "3GPP TS 44.018"};
inline constexpr Quantity rrStatus{"rr_status", "", Kind::state, 0, 255, "3GPP TS 44.018"};
inline constexpr Quantity rrMode{"rr_mode", "", Kind::state, 0, 1, "3GPP TS 44.018"};
inline constexpr Quantity rrcState{"rrc_state", "", Kind::state, 0, 5, "3GPP TS 25.331, 7.1"};
inline constexpr Quantity oneXState{"cdma_state", "", Kind::state, 0, 11, "3GPP2 C.S0005"};
inline constexpr Quantity evdoState{"evdo_state", "", Kind::state, 0, 5, "3GPP2 C.S0024"};
inline constexpr Quantity evdoSession{"evdo_session", "", Kind::state, 0, 4, "3GPP2 C.S0024"};
inline constexpr Quantity roaming{"roaming", "", Kind::state, 0, 255, "3GPP2 C.R1001"};
inline constexpr Quantity ciphering{"ciphering", "", Kind::state, 0, 1, "3GPP TS 33.102"};
inline constexpr Quantity dtx{"dtx", "", Kind::state, 0, 1, "3GPP TS 45.008, 8.3"};
inline constexpr Quantity access{"access", "", Kind::state, 0, 1, "3GPP TS 25.304, 5.3"};
inline constexpr Quantity accessRestrictions{"access_restrictions", "", Kind::state, 0, 255,
                                             "3GPP TS 25.304, 5.3"};
inline constexpr Quantity cellSet{"cell_set", "", Kind::state, 0, 3, "3GPP TS 25.331, 8.4"};
inline constexpr Quantity rat{"rat", "", Kind::state, 0, 4, ""};
inline constexpr Quantity flag{"flag", "", Kind::state, 0, 1, ""};

// Counts.
inline constexpr Quantity crcs{"crcs", "", Kind::count, 0, 4294967295, "3GPP TS 25.215, 5.1.4"};
inline constexpr Quantity crcErrors{"crc_errors", "", Kind::count, 0, 4294967295, "3GPP TS 25.215, 5.1.4"};
inline constexpr Quantity receivedBits{"received_bits", "bit", Kind::count, 0, 4294967295, ""};
inline constexpr Quantity newTransmissions{"new_transmissions", "", Kind::count, 0, 65535, ""};
inline constexpr Quantity blockErrors{"block_errors", "", Kind::count, 0, 65535, ""};
inline constexpr Quantity subFrames{"sub_frames", "", Kind::count, 0, 1023, ""};
inline constexpr Quantity antennas{"antennas", "", Kind::count, 1, 4, "3GPP TS 36.211, 6.2.1"};
inline constexpr Quantity count{"count", "", Kind::count, 0, 255, ""};
inline constexpr Quantity drxCycles{"drx_cycles", "", Kind::count, 0, 63, "3GPP TS 36.133, 4.2.2.1"};

// Parameters.
inline constexpr Quantity version{"version", "", Kind::parameter, 0, 255, ""};
inline constexpr Quantity bandwidth{"bandwidth", "RB", Kind::parameter, 6, 100, "3GPP TS 36.101, 5.6"};
inline constexpr Quantity priority{"priority", "", Kind::parameter, 0, 7, "3GPP TS 36.304, 5.2.4.1"};
inline constexpr Quantity qrxlevmin{"qrxlevmin", "dBm", Kind::parameter, -140, -44, "3GPP TS 36.331, 6.3.4"};
inline constexpr Quantity pMax{"p_max", "dBm", Kind::parameter, -30, 33, "3GPP TS 36.331, 6.3.4"};
inline constexpr Quantity ueTxPower{"ue_tx_power_max",    "dBm", Kind::parameter, -30, 33,
                                    "3GPP TS 36.101, 6.2"};
inline constexpr Quantity searchThreshold{"search_threshold",       "dB", Kind::parameter, 0, 62,
                                          "3GPP TS 36.304, 5.2.4.2"};
inline constexpr Quantity measurementRules{"measurement_rules",      "", Kind::parameter, 0, 15,
                                           "3GPP TS 36.304, 5.2.4.2"};
inline constexpr Quantity frameNumber{"frame_number", "", Kind::parameter, 0, 10239, "3GPP TS 36.211, 4.1"};
inline constexpr Quantity window{"window", "", Kind::parameter, 0, 65535, ""};
inline constexpr Quantity carriers{"carriers", "", Kind::parameter, 0, 3, "3GPP TS 25.308"};
inline constexpr Quantity hoppingSequence{"hopping_sequence",     "", Kind::parameter, 0, 63,
                                          "3GPP TS 45.002, 6.2.2"};
inline constexpr Quantity operatingMode{"operating_mode", "", Kind::parameter, 0, 2, "3GPP TS 23.060, 6.3.3"};
inline constexpr Quantity cellOption{"cell_option", "", Kind::parameter, 0, 255, "3GPP TS 44.060, 12.24"};
inline constexpr Quantity drxTimer{"drx_timer", "s", Kind::parameter, 0, 64, "3GPP TS 44.060, 12.24"};
inline constexpr Quantity protocolRevision{"protocol_revision", "", Kind::parameter, 0, 255, "3GPP2 C.S0005"};

// What a property list of the telephony daemon holds, by the kind of the value.
inline constexpr Quantity text{"text", "", Kind::text, 0, 0, ""};
inline constexpr Quantity integer{"integer", "", Kind::none, 0, 0, ""};
inline constexpr Quantity real{"real", "", Kind::none, 0, 0, ""};
inline constexpr Quantity boolean{"boolean", "", Kind::none, 0, 0, ""};
inline constexpr Quantity data{"data", "", Kind::none, 0, 0, ""};
inline constexpr Quantity date{"date", "", Kind::none, 0, 0, ""};

// A container that comes into being, with nothing in it yet.
inline constexpr Quantity list{"list", "", Kind::container, 0, 0, ""};
inline constexpr Quantity group{"group", "", Kind::container, 0, 0, ""};

// For a row that is none of these; the row's `reason` says why.
inline constexpr Quantity none{"none", "", Kind::none, 0, 0, ""};

inline constexpr std::array all{
    &rsrp, &rsrq, &rssi, &rscp, &rscpLevel, &ecno, &ecio, &carrierToInterference, &sir, &rxlev, &rxqual,
    &rxPower, &txPower, &srxlev, &c1, &c2, &ranking, &bler, &fer, &dataRate, &frequencyOffset, &frameOffset,
    &sampleOffset,
    //
    &arfcn, &uarfcn, &earfcn, &cdmaChannel, &bandClass, &band, &eutraBand, &bandInfo, &bsic, &ncc, &bcc,
    &scramblingCode, &cellParameter, &pci, &pnOffset, &cellId, &baseId, &lac, &rac, &tac, &uraId, &mcc, &mnc,
    &sid, &nid, &packetZone, &uati24, &colorCode, &channelId, &processId, &timeslot,
    //
    &mmState, &mmSubState, &gmmState, &gmmSubState, &mmUpdateStatus, &gmmUpdateStatus, &registrationState,
    &serviceType, &plmnSelection, &rrState, &rrSubState, &rrStatus, &rrMode, &rrcState, &oneXState,
    &evdoState, &evdoSession, &roaming, &ciphering, &dtx, &access, &accessRestrictions, &cellSet, &rat, &flag,
    //
    &crcs, &crcErrors, &receivedBits, &newTransmissions, &blockErrors, &subFrames, &antennas, &count,
    &drxCycles,
    //
    &version, &bandwidth, &priority, &qrxlevmin, &pMax, &ueTxPower, &searchThreshold, &measurementRules,
    &frameNumber, &window, &carriers, &hoppingSequence, &operatingMode, &cellOption, &drxTimer,
    &protocolRevision,
    //
    &text, &integer, &real, &boolean, &data, &date, &list, &group, &none};

}  // namespace quantity

// Null when there is none of this identifier.
constexpr const Quantity* quantityOf(std::string_view id) {
  const auto found = std::ranges::find(quantity::all, id, [](const Quantity* each) { return each->id; });
  return found == quantity::all.end() ? nullptr : *found;
}

// "measurement", "identity" and so on.
constexpr std::string_view nameOf(QuantityKind kind) {
  constexpr std::array<std::string_view, 8> names{"measurement", "identity", "state",     "count",
                                                  "parameter",   "text",     "container", "none"};
  return names[static_cast<std::size_t>(kind)];
}

}  // namespace kelvasi
