-- SPDX-License-Identifier: GPL-2.0-or-later
-- The rules of the CDMA records: sub-packets, pilots, and what is smoothed or counted from record to record.
do
  local constants = tables.constants
  local value, range, field_in = kelvasi.value, kelvasi.range, kelvasi.field_in
  local add_row, show_row, show_rows = kelvasi.add_row, kelvasi.show_row, kelvasi.show_rows

  local function part_of(section, of)
    for _, part in ipairs(section.parts) do
      if part.of == of then return part end
    end
  end

  local function not_understood(tree, why)
    kelvasi.warn(tree, "not_understood", why)
  end

  -- Where the first sub-packet of this identity begins; nil where one before it, or itself, has a bad size.
  local function sub_packet(record, id)
    local about = constants.sub_packets
    local from = about.first
    for _ = 1, value(record, 0, about.count) do
      local after = from + value(record, from, about.size)
      if after >= about.first + record.size then return nil end
      if value(record, from, about.id) == id then return from end
      from = after
    end
  end

  local function show_state(tree, record, section)
    local part = section.parts[1]
    if record.size ~= part.minimum then return not_understood(tree, "Another length than is known") end
    local fields = tables.layouts[part.layout]
    local state = value(record, 0, field_in(part.layout, "device state"))
    for _, row in ipairs(part.rows) do
      if row.absent and state < constants.evdo_access_state then
        add_row(tree, row, kelvasi.range_of(record, 0, fields[row.field]), nil)
      else
        show_row(tree, record, 0, part.layout, row)
      end
    end
  end

  -- A pilot by its place in the record and its PN offset.
  local function add_pilot(tree, record, row, from, size, place, offset, raw)
    local bytes = range(record, from, size)
    local item = tree:add(kelvasi.fields["kelvasi.entry"], bytes, place, string.format("Pilot %d", place))
    item:add(kelvasi.fields["kelvasi.pilot"], bytes, offset)
    add_row(item, row, bytes, raw)
  end

  -- Those of the record's list; `leaves_out` those without an offset, which are none.
  local function pilots_of(record, part, leaves_out)
    local list, pilots = tables.lists[part.entries], {}
    for place = 0, kelvasi.count_of(record, list) - 1 do
      local from = kelvasi.entry_at(record, list, place)
      local offset = value(record, from, field_in(part.layout, "PN offset"))
      if not (leaves_out and offset == constants.no_pilot) then
        pilots[#pilots + 1] = {from = from, place = place, offset = offset}
      end
    end
    return pilots
  end

  -- Without pilots the row shows what stands in place of a value.
  local function show_pilots(tree, record, part, leaves_out)
    local pilots, row = pilots_of(record, part, leaves_out), part.rows[1]
    if #pilots == 0 then return add_row(tree, row, range(record, 0, record.size), nil) end
    local inner = kelvasi.add_list(tree, record, part.list)
    for _, pilot in ipairs(pilots) do
      local raw = kelvasi.raw_of(record, pilot.from, part.layout, row)
      add_pilot(inner, record, row, pilot.from, tables.lists[part.entries].stride, pilot.place, pilot.offset, raw)
    end
  end

  local function size_of_list(record, part)
    local list = tables.lists[part.entries]
    return list.start + list.stride * kelvasi.count_of(record, list)
  end

  local function fingers(tree, record, section)
    local part = section.parts[1]
    if record.size ~= size_of_list(record, part) then return not_understood(tree, "Not as long as its fingers") end
    show_pilots(tree, record, part, true)
  end

  local function evdo_active_set(tree, record, section)
    local part = section.parts[1]
    if record.size < size_of_list(record, part) then
      return kelvasi.warn(tree, "too_short", "Shorter than its pilots")
    end
    show_pilots(tree, record, part, false)
  end

  -- Linear Ec/Io of a pilot's energy, at least -50 dB.
  local function pilot_scale(record, from, layout)
    local function named(name) return value(record, from, field_in(layout, name)) end
    local window, gain, power = named("window"), named("gain"), 2 ^ (2 * named("energy exponent") - 3)
    local divisor, noise = gain * 9 * window * window, 1 / window
    return function(energy)
      local ratio = power * energy / divisor - noise
      return 10 * log10(ratio < 0.00001 and 0.00001 or ratio)
    end
  end

  local reference_rows = {}
  local function reference_row(row)
    if not reference_rows[row] then
      reference_rows[row] = setmetatable({before = constants.device_status.before_reference}, {__index = row})
    end
    return reference_rows[row]
  end

  local function active_set(tree, record, about, from, part)
    local layout, row = about.others["sub-packet 3"], part.rows[1]
    local function named(name) return value(record, from, field_in(layout, name)) end
    local count, rake, reference = named("count"), named("fingers"), named("reference PN offset")
    local stride, decibels = math.floor((rake * 6 + 15) / 4) * 4, pilot_scale(record, from, layout)
    local inner = kelvasi.add_list(tree, record, part.list)
    for place = 0, count - 1 do
      local pilot = from + stride * place
      local offset = value(record, pilot, field_in(about.others.pilot, "PN offset"))
      local energy = kelvasi.bits(record, pilot + rake * 4 + 24, 0, 16)
      add_pilot(inner, record, offset == reference and reference_row(row) or row, pilot + 12, stride, place, offset,
                decibels(energy))
    end
  end

  -- The error rate of a call that has ended is shown once more.
  local function old_error_rate(tree, record, row)
    local rate = kelvasi.remembered(record, "old rate", function(state)
      local last = state.error_rate
      state.error_rate = nil
      return last
    end)
    if rate then add_row(tree, row, range(record, 0, record.size), rate * 100) end
  end

  local function device_status(tree, record, section, about)
    local ids = constants.device_status
    local state, radio = sub_packet(record, ids.state), sub_packet(record, ids.radio)
    local set, rake = sub_packet(record, ids.active_set), sub_packet(record, ids.fingers)
    if not (state and radio and set and rake) then return not_understood(tree, "A sub-packet is missing") end
    local states, radios = part_of(section, "sub-packet 1"), part_of(section, "sub-packet 2")
    local is_traffic = value(record, state, field_in(states.layout, "state")) == ids.traffic_state
    show_rows(tree, record, state, states)
    for _, row in ipairs(radios.rows) do
      local raw, field = kelvasi.raw_of(record, radio, radios.layout, row)
      if row.absent and not is_traffic then raw = nil end
      add_row(tree, row, kelvasi.range_of(record, radio, field), raw)
    end
    for _, part in ipairs(section.parts) do
      if not part.layout and part.list then active_set(tree, record, about, set, part) end
      if not part.layout and not part.list and not is_traffic then old_error_rate(tree, record, part.rows[1]) end
    end
  end

  local function error_rate(tree, record, section, about)
    local numbers = constants.traffic_fer
    local from = sub_packet(record, numbers.demodulation)
    if not from then return not_understood(tree, "The sub-packet of the demodulation is missing") end
    local is_error = value(record, from, field_in(about.others["sub-packet 11"], "frame error")) ~= 0
    local rate = kelvasi.remembered(record, "rate", function(state)
      local next_rate = is_error and numbers.new or 0
      if state.error_rate then
        next_rate = kelvasi.single(next_rate + kelvasi.single(state.error_rate * numbers.old))
      end
      state.error_rate = next_rate
      return next_rate
    end)
    add_row(tree, section.parts[1].rows[1], range(record, from, 25), rate * 100)
  end

  -- Another type of system has identities that are not known.
  local function system_parameters(tree, record, section)
    local part = section.parts[1]
    local version = value(record, 0, field_in(part.layout, "version"))
    if version < constants.system_version then
      return kelvasi.warn(tree, "unknown_version", string.format("Unknown version %d", version))
    end
    local is_cdma = value(record, 0, field_in(part.layout, "system type")) == constants.cdma_system
    local is_either = {}
    for _, row in ipairs(part.rows) do is_either[row.key] = is_either[row.key] or row.no_number end
    for _, row in ipairs(part.rows) do
      if not is_either[row.key] or is_cdma == not row.no_number then
        show_row(tree, record, 0, part.layout, row)
      end
    end
  end

  local function forward_bits(record)
    local about, sum = constants.forward_rate, 0
    for place, weight in ipairs(about.weights) do
      sum = sum + kelvasi.bits(record, about.first + 4 * (place - 1), 0, 32) * weight
    end
    return sum
  end

  local function packets_of_rate(record, about, rate)
    local sum = 0
    for sub_frame = 0, about.sub_frames - 1 do
      for half = 0, about.halves - 1 do
        local at = about.first + about.sub_frame_step * sub_frame + about.half_step * half + about.rate_step * rate
        for counter = 0, about.counters - 1 do
          sum = sum + kelvasi.bits(record, at + about.counter_step * counter, 0, 32)
        end
      end
    end
    return sum
  end

  local function reverse_bits(record)
    local about, sum = constants.reverse_rate, 0
    for place, weight in ipairs(about.weights) do
      sum = sum + packets_of_rate(record, about, place - 1) * weight
    end
    return sum
  end

  -- What was sent since the record before, of which there may be none: {rate} or {}; nil where no row is written.
  local function rate_since(last, sequence, sent)
    if not last then return {} end
    local steps = (sequence - last.sequence + 2 ^ 31) % 2 ^ 32 - 2 ^ 31
    return steps >= 1 and {(sent - last.sent) / (steps * 1024)} or nil
  end

  local function rate_rule(link, bits_of)
    return function(tree, record, section, about)
      local part = section.parts[1]
      local sequence = value(record, 0, field_in(about.heads[1], "sequence number"))
      local rate = kelvasi.remembered(record, link, function(state)
        local last, sent = state[link], bits_of(record)
        state[link] = {sequence = sequence, sent = sent}
        return rate_since(last, sequence, sent)
      end)
      if rate then add_row(tree, part.rows[1], range(record, 0, record.size), rate[1]) end
    end
  end

  local function set(code, section, rule) kelvasi.rules[code] = {[section] = rule} end
  set(0x108A, "1x", fingers)
  set(0x1183, "EV-DO", show_state)
  set(0x1192, "EV-DO Data Rates", rate_rule("forward", forward_bits))
  set(0x127E, "EV-DO Data Rates", rate_rule("reverse", reverse_bits))
  set(0x12B6, "EV-DO", evdo_active_set)
  set(0x119C, "1x", device_status)
  set(0x119D, "1x", error_rate)
  set(0x134F, "1x System", system_parameters)

  -- Raw fields of the sub-packets.
  function kelvasi.each_sub_packet(record, about, show)
    for of, layout in pairs(about.others) do
      local id = tonumber(of:match("^sub%-packet (%d+)$"))
      local from = id and sub_packet(record, id)
      if from then show("Sub-packet " .. id, layout, from) end
    end
  end
end
