-- SPDX-License-Identifier: GPL-2.0-or-later
-- Sections that show more than their tables say. A rule is by the record's code and the section's name; the
-- sections without one go by their tables alone.
do
  local constants = tables.constants
  local value, range, field_in = kelvasi.value, kelvasi.range, kelvasi.field_in
  local add_row, show_rows, show_part = kelvasi.add_row, kelvasi.show_rows, kelvasi.show_part
  local each_entry, raw_of = kelvasi.each_entry, kelvasi.raw_of
  local function lists(part) return tables.lists[part.entries] end

  -- Whole dB for a linear Ec/No.
  local function decibels(linear)
    for _, step in ipairs(constants.ecno_steps) do
      if linear >= step[1] then return step[2] end
    end
    return 0
  end

  -- The list of a record whose entries have this field.
  local function list_with(about, name)
    for _, list in ipairs(about.lists) do
      if field_in(tables.lists[list].layout, name) then return tables.lists[list] end
    end
  end

  -- The first energy that is not 0 counts. The energies stand behind the last identity.
  local function energy_of(record, list, place)
    for _, field in ipairs(tables.layouts[list.layout]) do
      local energy = value(record, kelvasi.entry_at(record, list, place), field)
      if energy ~= 0 then return energy end
    end
    return 0
  end

  local function active_set(tree, record, section, about)
    local identity, calculated = section.parts[1], section.parts[2]
    local membership = field_in(identity.layout, "set membership")
    local agc = value(record, 0, field_in(about.heads[1], "receive AGC"))
    local shifted = agc + 512
    local level = (shifted - math.fmod(shifted, 10)) / 10 - 106  -- towards zero
    local shown, list, energies = 0, lists(identity), list_with(about, "energy 1")
    for place = 0, kelvasi.count_of(record, list) - 1 do
      local from = kelvasi.entry_at(record, list, place)
      if value(record, from, membership) == constants.active_set_member then
        local item = kelvasi.add_entry(tree, record, from, list.stride, shown)
        local ecno = decibels(energy_of(record, energies, place))
        show_rows(item, record, from, identity)
        add_row(item, calculated.rows[1], range(record, from, list.stride), level + ecno)
        add_row(item, calculated.rows[2], range(record, from, list.stride), ecno)
        shown = shown + 1
      end
    end
  end

  -- Digits of one byte each, every other byte another number's.
  local function equivalent_plmns(tree, record, section)
    local part = section.parts[1]
    local fields = tables.layouts[part.layout]
    each_entry(tree, record, lists(part), function(item, from)
      for _, row in ipairs(part.rows) do
        local function digit(place) return value(record, from, fields[row.field + place]) end
        add_row(item, row, range(record, from, 6), digit(0) * 100 + digit(2) * 10 + digit(4))
      end
    end)
  end

  local function packed_digits(record, layout, name)
    local packed = 0
    for place = 1, 3 do
      packed = packed + value(record, 0, field_in(layout, name .. " digit " .. place)) * 16 ^ (place - 1)
    end
    return packed
  end

  local function serving_plmn(tree, record, section)
    local digits, rest = section.parts[1], section.parts[2]
    add_row(tree, digits.rows[1], range(record, 15, 2), packed_digits(record, digits.layout, "MCC"))
    add_row(tree, digits.rows[2], range(record, 16, 2), packed_digits(record, digits.layout, "MNC"))
    show_part(tree, record, rest)
  end

  -- The codes of cells come with a record of their own, which shows nothing itself.
  local function learn_codes(_, record, section)
    local list = lists(section.parts[1])
    local arfcn, bsic = field_in(list.layout, "ARFCN"), field_in(list.layout, "BSIC")
    kelvasi.learn(record, function(state)
      state.codes = {}
      for place = 0, kelvasi.count_of(record, list) - 1 do
        local from = kelvasi.entry_at(record, list, place)
        state.codes[value(record, from, arfcn)] = value(record, from, bsic)
      end
    end)
  end

  local function neighbours(tree, record, section)
    local part, coded = section.parts[1], section.parts[2]
    local known = kelvasi.remembered(record, "codes", function(state) return state.codes or {} end)
    local arfcn = field_in(part.layout, "ARFCN")
    each_entry(tree, record, lists(part), function(item, from)
      show_rows(item, record, from, part)
      local code = known[value(record, from, arfcn)]
      if code then add_row(item, coded.rows[1], range(record, from, 2), code) end
    end)
  end

  -- The mean of the samples that are not 0.
  local function transmit_power(tree, record, section, about)
    local list = list_with(about, "transmit AGC")
    local agc = field_in(list.layout, "transmit AGC")
    local sum, count = 0, 0
    for place = 0, kelvasi.count_of(record, list) - 1 do
      local sample = value(record, kelvasi.entry_at(record, list, place), agc)
      if sample ~= 0 then
        local shifted = sample + 512
        sum, count = sum + (shifted - math.fmod(shifted, 10)) / 10 - 70, count + 1
      end
    end
    add_row(tree, section.parts[1].rows[1], range(record, 0, record.size), count > 0 and sum / count or kelvasi.nan)
  end

  -- A cell in none of the sets has no row that says so.
  local function utran_neighbours(tree, record, section)
    local part = section.parts[1]
    each_entry(tree, record, lists(part), function(item, from)
      for _, row in ipairs(part.rows) do
        local raw = raw_of(record, from, part.layout, row)
        if row.key ~= "Status" or tables.texts[row.texts][raw + 1] then
          kelvasi.show_row(item, record, from, part.layout, row)
        end
      end
    end)
  end

  -- A ratio for each timeslot, in fields that follow each other.
  local function ratios(tree, record, section)
    local channel, ratio = section.parts[1], section.parts[2]
    each_entry(tree, record, lists(channel), function(item, from)
      show_rows(item, record, from, channel)
      local inner = kelvasi.add_list(item, record, ratio.list)
      for slot = 0, constants.timeslots - 1 do
        local field = tables.layouts[ratio.layout][ratio.rows[1].field + slot]
        add_row(inner, ratio.rows[1], kelvasi.range_of(record, from, field), value(record, from, field))
      end
    end)
  end

  -- A record of another version says nothing of the state. A short one is read with what it lacks as 0.
  local function rrc_state(tree, record, section)
    local part = section.parts[1]
    local version = value(record, 0, field_in(part.layout, "layout version"))
    local row = part.rows[1]
    if version == constants.rrc_version then return show_part(tree, record, part) end
    kelvasi.warn(tree, "unknown_version", string.format("Unknown version %d", version))
    add_row(tree, row, range(record, 14, 1), row.special[1])
  end

  -- Behind the priority and the type, what is the type's own.
  local rat_names = {[0] = "an LTE", "a UTRAN", "a GERAN", "a CDMA", "a CDMA"}
  local function part_of_rat(parts, rat)
    for _, part in ipairs(parts) do
      if rat_names[rat] and part.of == "byte 4 of " .. rat_names[rat] .. " entry" then return part end
    end
  end
  local function candidates(tree, record, section)
    local head = section.parts[1]
    local rat_type = field_in(head.layout, "RAT type")
    each_entry(tree, record, lists(head), function(item, from)
      show_rows(item, record, from, head)
      local own = part_of_rat(section.parts, value(record, from, rat_type))
      if own then show_rows(item, record, from + constants.rat_specific, own) end
    end)
  end

  kelvasi.rules = {
    [0x417A] = {["Active Set"] = active_set},
    [0x7150] = {["Equivalent PLMN List"] = equivalent_plmns},
    [0x7135] = {["Serving PLMN"] = serving_plmn},
    [0x51FF] = {["Neighboring Cells"] = learn_codes},
    [0x5137] = {["Neighboring Cells"] = neighbours},
    [0x4031] = {["UMTS RR Info"] = transmit_power},
    [0xD00A] = {["Neighbor Cell List"] = utran_neighbours},
    [0xD00C] = {["CCTRCH SIR"] = ratios},
    [0xD0E0] = {["RRC Info"] = rrc_state},
    [0xB186] = {["Reselection Candidates List"] = candidates},
  }
end
