// SPDX-License-Identifier: Apache-2.0
#include "Simulator/Radio/TrueCell.h"

namespace kelvasi::sim {

namespace {

RadioFamily familyOf(const Cell& cell) {
  switch (cell.technology) {
    case Technology::gsm:
      return RadioFamily::gsm;
    case Technology::umts:
      return cell.isTdd ? RadioFamily::utraTdd : RadioFamily::umts;
    case Technology::lte:
      return RadioFamily::lte;
    case Technology::cdma:
      break;
  }
  return RadioFamily::cdma;
}

}  // namespace

CellIdentity identityOf(const Cell& cell) {
  return {familyOf(cell), cell.frequency, cell.code};
}

TrueLevels levelsOf(const Reception& heard) {
  return {.level = heard.level, .quality = heard.ecNo};
}

}  // namespace kelvasi::sim
