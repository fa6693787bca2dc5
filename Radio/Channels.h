// SPDX-License-Identifier: Apache-2.0
// Channel numbers to bands and frequencies, for every number of 32 bits. Where the standards let one number
// mean several carriers, all of them are given; where they give none, or leave it to the network, none.
//
// To add a band: a row in the table of its technology. A technology more (5G NR) is a function and a table
// more.
#pragma once

#include <cstdint>
#include <optional>

#include "Radio/Carrier.h"

namespace kelvasi {

enum class LinkDirection : std::uint8_t { downlink, uplink };

// By ARFCN (3GPP TS 45.005, clause 2). 512 to 810 is DCS 1800 or PCS 1900. A number of the 900 MHz band
// carries the name of the smallest of its extensions (P, E, R, ER) that has it. The bands whose numbers a
// network assigns (T-GSM 380, 410 and 810, GSM 710) have none of their own.
Carriers gsmCarriers(std::uint32_t arfcn);

// By UARFCN of one direction (3GPP TS 25.101, clause 5.4); the two directions share numbers. Without the
// additional channels of band XXVI.
Carriers utraFddCarriers(std::uint32_t uarfcn, LinkDirection direction = LinkDirection::downlink);

// By UARFCN (3GPP TS 25.102, clause 5.4), as far as a carrier of the 1.28 Mcps option, the narrowest, lies in
// the band. Without the additional channels of band d.
Carriers utraTddCarriers(std::uint32_t uarfcn);

// By E-ARFCN, which says itself whether it is the downlink's or the uplink's (3GPP TS 36.101, table 5.7.3-1).
// Without band 54, bands from 106 up, and those for satellites.
Carriers eutraCarriers(std::uint32_t earfcn);

// The uplink's E-ARFCN that belongs to a downlink's; the same in TDD. None for another number, and in a band
// for downlinks only.
std::optional<std::uint32_t> eutraUplinkNumber(std::uint32_t earfcn);

// By channel number, in all band classes or in one of them (3GPP2 C.S0057). Without the classes 11 and 16 and
// up; class 7 to channel 240.
Carriers cdmaCarriers(std::uint32_t channel);
Carriers cdmaCarriers(std::uint32_t channel, std::uint32_t bandClass);

}  // namespace kelvasi
