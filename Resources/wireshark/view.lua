-- SPDX-License-Identifier: GPL-2.0-or-later
-- A record is read in one place: `record` is {bytes, buffer, start, size}, the last two where it begins in the
-- packet and how long it is. A byte past its end reads as 0, as it does for the decoders.
do
  local floor, byte, min = math.floor, string.byte, math.min

  -- `width` bits upwards from bit `bit` of byte `at`.
  function kelvasi.bits(record, at, bit, width)
    local raw, weight, bytes, first = 0, 1, record.bytes, record.start + 1
    for place = first + at, first + at + floor((bit + width + 7) / 8) - 1 do
      raw = raw + (byte(bytes, place) or 0) * weight
      weight = weight * 256
    end
    return floor(raw / 2 ^ bit) % 2 ^ width
  end
  local bits = kelvasi.bits

  -- The value of a field whose bytes count from `from`.
  function kelvasi.value(record, from, field)
    local width = field[4]
    local raw = bits(record, from + field[2], field[3], width)
    if field[6] then raw = raw % 256 * 256 + floor(raw / 256) end
    if field[5] and raw >= 2 ^ (width - 1) then raw = raw - 2 ^ width end
    return raw
  end

  -- The bytes in the packet, as far as they are there.
  function kelvasi.range(record, at, count)
    local first = min(record.start + at, #record.bytes)
    return record.buffer(first, min(count, #record.bytes - first))
  end
  local range = kelvasi.range

  function kelvasi.range_of(record, from, field)
    return range(record, from + field[2], floor((field[3] + field[4] + 7) / 8))
  end

  -- By its name, which the layout has.
  function kelvasi.field_in(layout, name)
    for _, field in ipairs(tables.layouts[layout]) do
      if field[1] == name then return field end
    end
  end

  -- How many entries a record says that it has, whether or not it has the bytes.
  function kelvasi.count_of(record, list)
    return kelvasi.value(record, 0, list.count) % 2 ^ list.low_bits + list.uncounted
  end

  -- Where entry `place` begins, the first being 0.
  function kelvasi.entry_at(record, list, place)
    local before = list.count_before and kelvasi.value(record, 0, list.count_before) * list.bytes_before or 0
    return list.start + before + list.stride * place
  end

  function kelvasi.warn(tree, name, text)
    tree:add_proto_expert_info(kelvasi.experts[name], text or kelvasi.warnings[name])
  end
end
