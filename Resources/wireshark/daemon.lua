-- SPDX-License-Identifier: GPL-2.0-or-later
-- What comes as a property list: the daemon's own records, and the messages of the object stream.
do
  local fields = kelvasi.fields
  local header = 13

  -- The magnitude of a whole number in two halves of 32 bits; nil when it has more.
  local function halves(digits)
    local low, high = 0, 0
    for digit in digits:gmatch("%d") do
      low = low * 10 + tonumber(digit)
      high = high * 10 + math.floor(low / 2 ^ 32)
      low = low % 2 ^ 32
    end
    if high < 2 ^ 32 then return low, high end
  end

  local function hexadecimal(text)
    local number = tonumber(text)
    return number and number < 2 ^ 53 and string.format("%d", number)
  end

  local function add_integer(tree, bytes, text)
    local sign, digits = text:match("^([+-]?)(%d+)$")
    local low, high = halves(digits or hexadecimal(text) or "")
    if not low then return end
    if sign ~= "-" and high >= 2 ^ 31 then
      return tree:add(fields["kelvasi.plist.unsigned"], bytes, UInt64.new(low, high))
    end
    local number = Int64.new(low, high)
    return tree:add(fields["kelvasi.plist.integer"], bytes, sign == "-" and -number or number)
  end

  local adders = {
    integer = add_integer,
    string = function(tree, bytes, text) return tree:add(fields["kelvasi.plist.string"], bytes, text) end,
    date = function(tree, bytes, text) return tree:add(fields["kelvasi.plist.date"], bytes, text) end,
    real = function(tree, bytes, number)
      if number - number == 0 then return tree:add(fields["kelvasi.plist.real"], bytes, number) end
    end,
    boolean = function(tree, bytes, is_so) return tree:add(fields["kelvasi.plist.boolean"], bytes, is_so) end,
    data = function(tree, bytes, data)
      if #data > 0 then
        local tvb = ByteArray.new(data, true):tvb("Data")
        return tree:add(fields["kelvasi.plist.data"], tvb())
      end
    end,
  }

  local function short(node)
    if node.kind == "dict" or node.kind == "array" then return "" end
    return ": " .. (node.kind == "data" and #node.value .. " bytes" or tostring(node.value))
  end

  local names = {}
  for _, row in ipairs(tables.names) do names[row.key] = row end

  -- A text that is a number and the name's unit, and nothing else.
  local function add_number_of_name(item, name, node, bytes)
    local row = names[name]
    local unit = row and row.unit or ""
    if not row or node.kind ~= "string" or node.value:sub(-#unit - 1):sub(-#unit) ~= unit and unit ~= "" then return end
    local number = node.value:sub(1, #node.value - #unit):match("^%+?(-?[%d.]+[eE]?[+-]?%d*)$")
    if number and tonumber(number) then kelvasi.add_number(item, row, bytes, tonumber(number)) end
  end

  local add_value
  local function add_entry(tree, record, from, field, name, label, node, row_name)
    local bytes = kelvasi.range(record, from + node.at, math.max(node.size, 0))
    local item = tree:add(fields[field], bytes, name, label .. short(node))
    add_value(item, record, from, node, bytes, row_name)
  end

  function add_value(item, record, from, node, bytes, row_name)
    if node.kind == "dict" then
      for _, entry in ipairs(node.value) do
        add_entry(item, record, from, "kelvasi.plist.key", entry[1], entry[1], entry[2], entry[1])
      end
    elseif node.kind == "array" then
      for place, element in ipairs(node.value) do
        add_entry(item, record, from, "kelvasi.plist.index", place - 1, "[" .. place - 1 .. "]", element, row_name)
      end
    else
      adders[node.kind](item, bytes, node.value)
      if record.is_object then add_number_of_name(item, row_name, node, bytes) end
    end
  end

  local function text_in(node, key)
    for _, entry in ipairs(node.kind == "dict" and node.value or {}) do
      if entry[1] == key then return entry[2] end
    end
  end

  -- A number of 32 bits with sign.
  local function number_in(cell, key)
    local node = text_in(cell, key)
    if not node or (node.kind ~= "integer" and node.kind ~= "real") then return nil end
    local number = tonumber(node.value)
    local is_whole = number and number % 1 == 0 and number >= -2 ^ 31 and number < 2 ^ 31
    if is_whole then return number, node end
  end

  local function takes(cells, cell)
    local radio, sort = text_in(cell, "kTelvonCellMonitorCellRadioAccessTechnology"),
                        text_in(cell, "kTelvonCellMonitorCellType")
    if not radio or not sort or sort.value ~= cells.type then return false end
    for _, each in ipairs(cells.radios) do
      if radio.value == each then return true end
    end
    return false
  end

  local function add_section(tree, record, name)
    return tree:add(fields["kelvasi.section"], kelvasi.range(record, 0, record.size), name, name)
  end

  local function show_cell(tree, record, cells, cell)
    for _, row in ipairs(cells.rows) do
      local number, node = number_in(cell, row.source)
      if number then
        kelvasi.add_row(tree, row, kelvasi.range(record, header + node.at, node.size), number)
      end
    end
  end

  -- Of serving cells a section shows the first; UTRA TDD shows each in turn, so that the last one stays.
  local function shows(cells, shown)
    return shown == 0 or not cells.serving or cells.technology == "utran2"
  end

  local function show_cells_of(tree, record, cells, list)
    local section, shown = nil, 0
    for _, cell in ipairs(list.kind == "array" and list.value or {}) do
      if takes(cells, cell) and shows(cells, shown) then
        section = section or add_section(tree, record, cells.section)
        local parent = section
        if not cells.serving then
          parent = kelvasi.add_entry(section, record, header + cell.at, cell.size, shown)
        end
        show_cell(parent, record, cells, cell)
        shown = shown + 1
      end
    end
  end

  -- The sections of the technology that the records before were of; of all as long as there was none.
  local function show_cells(tree, record, list)
    local technology = kelvasi.remembered(record, "technology", function(state) return state.technology end)
    for _, cells in ipairs(tables.cells) do
      if not technology or cells.technology == technology then show_cells_of(tree, record, cells, list) end
    end
  end

  local function show_contexts(tree, record, list)
    if list.kind ~= "array" then return end
    local section = add_section(tree, record, "PDP Context Info")
    for place, context in ipairs(list.value) do
      local at = header + context.at
      local item = kelvasi.add_entry(section, record, at, context.size, place - 1)
      add_value(item, record, header, context, kelvasi.range(record, at, context.size))
    end
  end

  local function show_sim(tree, record, files)
    local section
    for _, row in ipairs(tables.sim_files) do
      local node = text_in(files, row.source)
      if node and node.kind == "string" then
        section = section or add_section(tree, record, "SIM Info")
        local bytes = kelvasi.range(record, header + node.at, node.size)
        section:add(row.own, bytes, node.value, row.key .. ": " .. node.value)
      end
    end
  end

  local function show_list(tree, record, from)
    local node = kelvasi.plist_of(record.bytes:sub(record.start + from + 1))
    if not node then
      kelvasi.warn(tree, "no_plist")
      return nil
    end
    local item = tree:add(fields["kelvasi.plist"], kelvasi.range(record, from, record.size - from))
    add_value(item, record, from, node, kelvasi.range(record, from + node.at, node.size))
    return node
  end

  -- By the number of the daemon's record; a tree is shown of every one.
  function kelvasi.show_own_record(tree, record, code)
    local node = show_list(tree, record, header)
    local show = node and ({[0] = show_sim, show_cells, show_contexts})[code]
    if show then show(tree, record, node) end
  end

  function kelvasi.show_object(tree, record)
    record.is_object = true
    show_list(tree, record, 0)
  end
end
