-- SPDX-License-Identifier: GPL-2.0-or-later
-- A packet is a message of the log channel: a record of the baseband, one of the daemon's own, or an object.
do
  local fields, range = kelvasi.fields, kelvasi.range
  local format = string.format
  local header_size, prefix_mark, prefix_size = 13, 0x81, 2
  local of_baseband, of_daemon = 1, 0xFF
  local extra_codes = 0xFF0000  -- what the daemon's own records are numbered from
  local own_names = {[0] = "SIM files", "cells", "PDP contexts"}
  local technologies = {gsm = "GSM", lte = "LTE", utran2 = "UTRAN", cdma = "CDMA"}
  local unix_of_cdma = 315964800  -- 6 January 1980

  local function bits_at(record, at, width) return kelvasi.bits(record, at, 0, width) end

  -- The upper 48 bits count units of 1.25 ms, of which the lower 16 are a fraction (3GPP2 C.S0002).
  local function stamp(record)
    local units = bits_at(record, 7, 24) + bits_at(record, 10, 24) * 2 ^ 24 + bits_at(record, 5, 16) / 2 ^ 16
    local seconds = math.floor(units / 800)
    return NSTime.new(unix_of_cdma + seconds, math.floor((units / 800 - seconds) * 1e9)), units
  end

  local function show_header(tree, record, code)
    local sort = bits_at(record, 0, 8)
    local sorts = {[of_baseband] = "baseband", [of_daemon] = "daemon"}
    local item = tree:add(fields["kelvasi.type"], range(record, 0, 1), sort,
                          format("Log type: %s (%d)", sorts[sort] or "unknown", sort))
    if not sorts[sort] then kelvasi.warn(item, "unknown_type", format("Unknown log type %d", sort)) end
    local length = bits_at(record, 1, 16)
    local length_item = tree:add(fields["kelvasi.length"], range(record, 1, 2), length)
    if length ~= record.size - 1 then kelvasi.warn(length_item, "wrong_length") end
    local effective = sort == of_daemon and extra_codes + code or code
    tree:add(fields["kelvasi.code"], range(record, 3, 2), effective, format("Log code: 0x%04X", effective))
    local time, units = stamp(record)
    if units > 0 and units < 4e12 then tree:add(fields["kelvasi.time"], range(record, 5, 8), time) end
  end

  local function show_fields(tree, record, about, list, from)
    for _, field in ipairs(list) do
      tree:add(fields[about.names[field]], kelvasi.range_of(record, from, field), kelvasi.value(record, from, field))
    end
  end

  -- Entries that the record says it has and has no byte of hold no fields.
  local function show_fields_of_list(tree, record, about, list)
    local layout, count = tables.layouts[list.layout], kelvasi.count_of(record, list)
    if not layout or count == 0 then return end
    local item = tree:add(range(record, 0, record.size), "Entries: " .. list.count[1])
    for place = 0, count - 1 do
      local from = kelvasi.entry_at(record, list, place)
      if from >= record.size then return end
      show_fields(kelvasi.add_entry(item, record, from, list.stride, place), record, about, layout, from)
    end
  end

  local function show_all_fields(tree, record, about)
    local item = tree:add(fields["kelvasi.fields"], range(record, 0, record.size))
    show_fields(item, record, about, about.head, 0)
    for _, list in ipairs(about.lists) do
      show_fields_of_list(item, record, about, tables.lists[list])
    end
    kelvasi.each_sub_packet(record, about, function(title, layout, from)
      show_fields(item:add(range(record, from, 4), title), record, about, tables.layouts[layout], from)
    end)
  end

  local function shortest(section)
    local minimum = 0
    for _, part in ipairs(section.parts) do minimum = math.max(minimum, part.minimum or 0) end
    return minimum
  end

  local function show_section(tree, record, about, section)
    local minimum = shortest(section)
    if record.size < minimum then
      return kelvasi.warn(tree, "too_short", format("%s wants %d bytes, the record has %d", section.name, minimum,
                                                    record.size))
    end
    local item = tree:add(fields["kelvasi.section"], range(record, 0, record.size), section.name, section.name)
    local rule = (kelvasi.rules[about.code] or {})[section.name]
    if rule then return rule(item, record, section, about) end
    for _, part in ipairs(section.parts) do kelvasi.show_part(item, record, part) end
  end

  local function show_record(tree, record, code)
    local about = tables.records[code]
    if not about then
      kelvasi.warn(tree, "unknown_code", format("Unknown log code 0x%04X", code))
      return format("0x%04X, unknown", code)
    end
    kelvasi.learn(record, function(state) state.technology = about.technology end)
    local sections = {}
    for _, section in ipairs(about.sections) do
      show_section(tree, record, about, section)
      sections[#sections + 1] = section.name
    end
    show_all_fields(tree, record, about)
    return format("%s 0x%04X %s", technologies[about.technology] or about.technology, code,
                  table.concat(sections, ", "))
  end

  local function show_framed(tree, record)
    local code, sort = bits_at(record, 3, 16), bits_at(record, 0, 8)
    show_header(tree, record, code)
    if sort == of_daemon then
      kelvasi.show_own_record(tree, record, code)
      return "Daemon: " .. (own_names[code] or format("0x%04X, unknown", code))
    end
    -- A record of another type is shown where its technology shows it all the same.
    local about = tables.records[code]
    if sort ~= of_baseband and not (about and about.technology == "cdma") then return "Unknown log type" end
    return show_record(tree, record, code)
  end

  local function show(tree, record)
    if kelvasi.is_plist(record.bytes) then
      kelvasi.show_object(tree, record)
      return "Object"
    end
    if record.size < header_size then
      kelvasi.warn(tree, "no_record")
      return "Not a record"
    end
    if record.bytes:byte(1) == prefix_mark then
      tree:add(fields["kelvasi.prefix"], record.buffer(0, prefix_size))
      record.start, record.size = prefix_size, record.size - prefix_size
    end
    return show_framed(tree, record)
  end

  function kelvasi.proto.init() kelvasi.forget() end

  function kelvasi.proto.dissector(buffer, packet, tree)
    local size = buffer:captured_len()
    local record = {buffer = buffer, bytes = size > 0 and buffer:raw() or "", start = 0, size = size,
                    number = packet.number, is_again = packet.visited}
    packet.cols.protocol = "Kelvasi"
    packet.cols.info = show(tree:add(kelvasi.proto, buffer()), record)
    return size
  end

  DissectorTable.get("wtap_encap"):add(wtap.USER0, kelvasi.proto)
end
