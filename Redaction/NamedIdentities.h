// SPDX-License-Identifier: Apache-2.0
// What values of property lists identify, as far as their names tell. Docs/redaction.md lists them.
#pragma once

#include <array>
#include <string_view>

#include "Radio/Identifying.h"

namespace kelvasi {

struct NamedIdentity {
  std::string_view name;  // small letters and digits only, as `plainName` makes it
  Identifies identifies;
  std::string_view why;
  bool isPart = false;  // of a longer name, too
};

// The first that fits decides. To add a name, add its line, and one in Docs/redaction.md.
inline constexpr std::array namedIdentities{
    // Elementary files of the SIM (3GPP TS 31.102, 4.2): by their keys in the record and by their rows.
    NamedIdentity{"ksimfileiccid", Identifies::subscriber, "the number of the card"},
    NamedIdentity{"eficcid", Identifies::subscriber, "the number of the card"},
    NamedIdentity{"ksimfilemsisdn", Identifies::subscriber, "the telephone number"},
    NamedIdentity{"efmsisdn", Identifies::subscriber, "the telephone number"},
    NamedIdentity{"ksimfilembdn", Identifies::subscriber, "the number of the subscriber's mail box"},
    NamedIdentity{"ef3gppmailboxdialingnumber", Identifies::subscriber,
                  "the number of the subscriber's mail box"},
    NamedIdentity{"ksimfileloci", Identifies::subscriber, "a temporary identity and the location area"},
    NamedIdentity{"efloci", Identifies::subscriber, "a temporary identity and the location area"},
    NamedIdentity{"ksimfilepsloci", Identifies::subscriber, "a temporary identity and the routing area"},
    NamedIdentity{"efgprspsloci", Identifies::subscriber, "a temporary identity and the routing area"},
    NamedIdentity{"ksimfileacc", Identifies::subscriber, "follows the last digit of the IMSI"},
    NamedIdentity{"efaccesscontrolclass", Identifies::subscriber, "follows the last digit of the IMSI"},
    NamedIdentity{"ksimfilefplmn", Identifies::place, "networks that refused, and so where the handset was"},
    NamedIdentity{"effplmn", Identifies::place, "networks that refused, and so where the handset was"},
    NamedIdentity{"ksimfilehpplmn", Identifies::nothing, "a timer"},
    NamedIdentity{"efhpplmnsearchperiod", Identifies::nothing, "a timer"},
    NamedIdentity{"ksimfilead", Identifies::nothing, "the kind of card"},
    NamedIdentity{"efadministrativedata", Identifies::nothing, "the kind of card"},
    NamedIdentity{"ksimfileahplmn", Identifies::nothing, "a network"},
    NamedIdentity{"efactinghplmn", Identifies::nothing, "a network"},
    NamedIdentity{"ksimfileratmode", Identifies::nothing, "a list of technologies"},
    NamedIdentity{"efratmode", Identifies::nothing, "a list of technologies"},
    NamedIdentity{"ksimfilepnn", Identifies::nothing, "the operator's, the same on all its cards"},
    NamedIdentity{"efplmnnetworkname", Identifies::nothing, "the operator's, the same on all its cards"},
    NamedIdentity{"ksimfileopl", Identifies::nothing, "the operator's, the same on all its cards"},
    NamedIdentity{"efoperatorplmnlist", Identifies::nothing, "the operator's, the same on all its cards"},
    NamedIdentity{"ksimfileoplmnact", Identifies::nothing, "the operator's, the same on all its cards"},
    NamedIdentity{"efoplmnact", Identifies::nothing, "the operator's, the same on all its cards"},
    // When something was.
    NamedIdentity{"timestamp", Identifies::nothing, "when"},
    NamedIdentity{"date", Identifies::nothing, "when"},
    // Of PDP contexts and of the object stream.
    NamedIdentity{"nsapi", Identifies::nothing, "a number from 5 to 15"},
    NamedIdentity{"pdptype", Identifies::nothing, "a protocol"},
    NamedIdentity{"accesspoint", Identifies::subscriber, "a company's names its people", true},
    NamedIdentity{"apn", Identifies::subscriber, "a company's names its people"},
    NamedIdentity{"address", Identifies::subscriber, "of the handset, or of what it talks to", true},
    NamedIdentity{"dns", Identifies::subscriber, "an address", true},
    NamedIdentity{"gateway", Identifies::subscriber, "an address", true},
    NamedIdentity{"user", Identifies::subscriber, "who logs in", true},
    NamedIdentity{"password", Identifies::subscriber, "who logs in", true},
    // Identities of 3GPP TS 23.003, whatever stands around the name.
    NamedIdentity{"imsi", Identifies::subscriber, "the subscription", true},
    NamedIdentity{"imei", Identifies::subscriber, "the device", true},
    NamedIdentity{"meid", Identifies::subscriber, "the device", true},
    NamedIdentity{"esn", Identifies::subscriber, "the device"},
    NamedIdentity{"serial", Identifies::subscriber, "the device", true},
    NamedIdentity{"iccid", Identifies::subscriber, "the card", true},
    NamedIdentity{"msisdn", Identifies::subscriber, "a telephone number", true},
    NamedIdentity{"mdn", Identifies::subscriber, "a telephone number"},
    NamedIdentity{"phone", Identifies::subscriber, "a telephone number", true},
    NamedIdentity{"dialing", Identifies::subscriber, "a telephone number", true},
    NamedIdentity{"tmsi", Identifies::subscriber, "a temporary identity of the subscription", true},
    NamedIdentity{"guti", Identifies::subscriber, "a temporary identity of the subscription", true},
    NamedIdentity{"uati", Identifies::subscriber, "a temporary identity of the device", true},
    NamedIdentity{"subscriber", Identifies::subscriber, "the subscription", true},
    NamedIdentity{"latitude", Identifies::place, "a position", true},
    NamedIdentity{"longitude", Identifies::place, "a position", true},
    NamedIdentity{"eci", Identifies::place, "a cell"},
    NamedIdentity{"cellidentity", Identifies::place, "a cell", true},
    NamedIdentity{"areacode", Identifies::place, "an area", true},
};

}  // namespace kelvasi
