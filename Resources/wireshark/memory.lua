-- SPDX-License-Identifier: GPL-2.0-or-later
-- What rows take from earlier records. Packets come in order once, and again in any order: what a packet took
-- the first time is kept for it.
do
  local kept, state = {}, {}  -- the latter under names of the rules' own

  function kelvasi.forget()
    kept, state = {}, {}
  end

  -- Calls `take` with it when this packet comes for the first time.
  function kelvasi.learn(record, take)
    if not record.is_again then take(state) end
  end

  -- What `take` gives for this packet when it comes for the first time; nil is kept as well.
  function kelvasi.remembered(record, name, take)
    local key = name .. record.number
    if not record.is_again or kept[key] == nil then kept[key] = {take(state)} end
    return kept[key][1]
  end

  -- As 32 bits hold it.
  function kelvasi.single(number)
    return (Struct.unpack("<f", Struct.pack("<f", number)))
  end

  -- Not a number, without the sign that dividing 0 by 0 gives on some processors.
  kelvasi.nan = 0 / 0
  if string.format("%f", kelvasi.nan):sub(1, 1) == "-" then kelvasi.nan = -kelvasi.nan end
end
