-- SPDX-License-Identifier: GPL-2.0-or-later
-- A row of the display: its text and its number are functions of the row and the raw value. A raw value of nil
-- stands for "there is none".
do
  local format, floor = string.format, math.floor
  local value, range, range_of = kelvasi.value, kelvasi.range, kelvasi.range_of

  local function signed(number, bits)
    local within = number % 2 ^ bits
    return within < 2 ^ (bits - 1) and within or within - 2 ^ bits
  end

  local function whole(row, raw)
    local number = raw * (row.factor or 1) + (row.offset or 0)
    return row.unsigned and number or signed(number, 32)
  end

  local function scaled(scale, raw)
    if scale.curve then return scale.curve(raw) end
    return raw * scale.factor + scale.offset
  end

  local function digit_at(raw, place) return floor(raw / 16 ^ place) % 16 end

  local function digits_of(row, raw)
    local text = ""
    for place = 0, row.digits - 1 do
      local digit = digit_at(raw, place)
      text = text .. (digit < 10 and format("%d", digit) or " ")
    end
    return text
  end

  local function numeral(row, raw)
    if row.scale then return format(row.scale.format, scaled(row.scale, raw)) end
    if row.digits then return digits_of(row, raw) end
    if row.hex_digits then return format("0x%0" .. row.hex_digits .. "x", raw) end
    return format("%d", whole(row, raw))
  end

  local function named(row, raw)
    local place = row.flag and raw ~= 0 and 1 or raw
    local text = tables.texts[row.texts][place + 1] or row.otherwise or ""
    return (text:gsub("%%d", format("%d", signed(raw, 32))))
  end

  function kelvasi.text_of(row, raw)
    if raw == nil then return row.absent or "" end
    if row.special and row.special[1] == raw then return row.special[2] end
    if row.texts then return named(row, raw) end
    return (row.before or "") .. numeral(row, raw) .. (row.unit or "")
  end

  -- In the quantity's unit, a state's raw number; nil where there is none.
  function kelvasi.number_of(row, raw)
    if row.no_number or raw == nil or (row.special and row.special[1] == raw) then return nil end
    if row.scale then
      local number = scaled(row.scale, raw)
      return number - number == 0 and number or nil
    end
    if row.digits then return tonumber((digits_of(row, raw):gsub(" ", ""))) end
    if row.texts or row.hex_digits then return raw end
    if row.signed then return signed(raw, row.low_bits or 32) end
    return whole(row, raw)
  end

  local function fits(kind, number)
    if kind == "double" then return true end
    local least = kind == "int32" and -2 ^ 31 or 0
    return number % 1 == 0 and number >= least and number < least + 2 ^ 32
  end

  -- The row's quantity below it, in its true unit.
  function kelvasi.add_number(item, row, bytes, number)
    if not (number and row.number and fits(row.number_kind, number)) then return end
    local shown = format(row.number_kind == "double" and "%.15g" or "%d", number)
    item:add(row.number, bytes, number, row.number_title .. ": " .. shown .. row.number_unit):set_generated()
  end

  function kelvasi.add_row(tree, row, bytes, raw)
    local text, number = kelvasi.text_of(row, raw), kelvasi.number_of(row, raw)
    local label, item = row.key .. ": " .. text, nil
    if row.own_kind == "string" then
      item = tree:add(row.own, bytes, text, label)
    elseif number and fits(row.own_kind, number) then
      item = tree:add(row.own, bytes, number, label)
    else
      item = tree:add(row.words, bytes, text, label)
    end
    kelvasi.add_number(item, row, bytes, number)
  end

  -- What a row's field holds.
  function kelvasi.raw_of(record, from, layout, row)
    local field = tables.layouts[layout][row.field]
    local raw = value(record, from, field)
    return row.low_bits and row.low_bits < field[4] and raw % 2 ^ row.low_bits or raw, field
  end

  function kelvasi.show_row(tree, record, from, layout, row)
    local raw, field = kelvasi.raw_of(record, from, layout, row)
    kelvasi.add_row(tree, row, range_of(record, from, field), raw)
  end

  function kelvasi.show_rows(tree, record, from, part)
    for _, row in ipairs(part.rows) do kelvasi.show_row(tree, record, from, part.layout, row) end
  end

  function kelvasi.add_entry(tree, record, from, size, place)
    local item = tree:add(kelvasi.fields["kelvasi.entry"], range(record, from, size), place,
                          format("Entry %d", place))
    if from >= record.size then kelvasi.warn(item, "beyond") end
    return item
  end

  function kelvasi.add_list(tree, record, name)
    return tree:add(kelvasi.fields["kelvasi.list"], range(record, 0, record.size), name, name)
  end

  -- Calls `show` with the item, where the entry begins, and its place.
  function kelvasi.each_entry(tree, record, list, show)
    for place = 0, kelvasi.count_of(record, list) - 1 do
      local from = kelvasi.entry_at(record, list, place)
      show(kelvasi.add_entry(tree, record, from, list.stride, place), from, place)
    end
  end

  function kelvasi.show_part(tree, record, part)
    if not part.layout then return end
    if not part.entries then return kelvasi.show_rows(tree, record, 0, part) end
    local parent = part.list and kelvasi.add_list(tree, record, part.list) or tree
    kelvasi.each_entry(parent, record, tables.lists[part.entries], function(item, from)
      kelvasi.show_rows(item, record, from, part)
    end)
  end
end
