-- SPDX-License-Identifier: GPL-2.0-or-later
-- The names of filters: of every row, of every quantity, of every field of every record.
local kelvasi = {proto = Proto("kelvasi", "Kelvasi log channel"), fields = {}, types = {}, experts = {},
                 warnings = {}}

do
  local wanted, order = {}, {}

  -- What both can hold.
  local function common(one, other)
    if one == other then return one end
    return (one == "string" or other == "string") and "string" or "double"
  end

  local function want(name, title, kind, about)
    if wanted[name] then
      wanted[name].kind = common(wanted[name].kind, kind)
    else
      wanted[name] = {title = title, kind = kind, about = about}
      order[#order + 1] = name
    end
    return name
  end

  local function slug(text)
    local name = text:lower():gsub("[^%w]+", "_"):gsub("^_", ""):gsub("_$", "")
    return name
  end

  local quantities = {}
  for _, quantity in ipairs(tables.quantities) do quantities[quantity.id] = quantity end
  local numberless = {text = true, container = true, none = true}

  -- Measurements have fractions, whether or not a row of today shows them.
  local function want_quantity(row)
    local quantity = quantities[row.quantity]
    if numberless[quantity.kind] then return end
    local kind = quantity.kind == "measurement" and "double" or row.unsigned and "uint32" or "int32"
    row.number_unit = quantity.unit and " " .. quantity.unit or ""
    row.number_title = quantity.id:gsub("_", " ")
    row.number_name = want("kelvasi." .. quantity.id, row.number_title, kind, quantity.source)
  end

  -- A row whose text matters is a string, the others are numbers; where such a row has none, it is its text.
  local function kind_of(row)
    if row.texts or row.digits then return "string" end
    return row.scale and "double" or row.unsigned and "uint32" or "int32"
  end

  local function want_row(technology, section, list, row)
    local name = "kelvasi." .. technology .. "." .. slug(section)
    if list and list ~= row.key then name = name .. "." .. slug(list) end
    row.own_name = want(name .. "." .. slug(row.key), row.key, kind_of(row))
    row.words_name = want(row.own_name .. ".text", row.key, "string")
    want_quantity(row)
  end

  local function want_fields(record, fields)
    for _, field in ipairs(fields) do
      local name = string.format("kelvasi.%04x.%s", record.code, slug(field[1]))
      record.names[field] = want(name, field[1], field[5] and "int32" or "uint32")
    end
  end

  local function is_in(fields, field)
    for _, each in ipairs(fields) do
      if each[2] == field[2] and each[3] == field[3] and each[4] == field[4] then return true end
    end
    return false
  end

  -- The fields at the head of a record, the counts of its lists among them, in the order of their bytes.
  local function head_of(record)
    local fields = {}
    for _, layout in ipairs(record.heads) do
      for _, field in ipairs(tables.layouts[layout]) do fields[#fields + 1] = field end
    end
    for _, list in ipairs(record.lists) do
      for _, name in ipairs({"count", "count_before"}) do
        local field = tables.lists[list][name]
        if field and not is_in(fields, field) then fields[#fields + 1] = field end
      end
    end
    table.sort(fields, function(one, other) return one[2] * 8 + one[3] < other[2] * 8 + other[3] end)
    return fields
  end

  local function want_record(code, record)
    record.code, record.names, record.head = code, {}, head_of(record)
    want_fields(record, record.head)
    for _, list in ipairs(record.lists) do want_fields(record, tables.layouts[tables.lists[list].layout] or {}) end
    for _, layout in pairs(record.others) do want_fields(record, tables.layouts[layout]) end
  end

  local rows = {}
  local function each_row(found)
    for _, row in ipairs(found) do rows[#rows + 1] = row end
    return ipairs(found)
  end

  for code, record in pairs(tables.records) do
    want_record(code, record)
    for _, section in ipairs(record.sections) do
      for _, part in ipairs(section.parts) do
        for _, row in each_row(part.rows) do want_row(record.technology, section.name, part.list, row) end
      end
    end
  end
  for _, cells in ipairs(tables.cells) do
    for _, row in each_row(cells.rows) do want_row(cells.technology, cells.section, nil, row) end
  end
  for _, row in each_row(tables.sim_files) do row.own_name = want("kelvasi.sim." .. slug(row.key), row.key, "string") end
  for _, row in each_row(tables.names) do want_quantity(row) end

  for name, title in pairs({section = "Section", list = "List", ["plist.key"] = "Key", ["plist.string"] = "String",
                            ["plist.date"] = "Date"}) do
    want("kelvasi." .. name, title, "string")
  end
  for name, title in pairs({["type"] = "Log type", length = "Length", entry = "Entry", pilot = "PN offset",
                            ["plist.index"] = "Index"}) do
    want("kelvasi." .. name, title, "uint32")
  end
  want("kelvasi.plist.real", "Real", "double")

  local makers = {
    string = function(name, field) return ProtoField.string(name, field.title, base.NONE, field.about) end,
    double = function(name, field) return ProtoField.double(name, field.title, field.about) end,
    int32 = function(name, field) return ProtoField.int32(name, field.title, base.DEC, nil, nil, field.about) end,
    uint32 = function(name, field) return ProtoField.uint32(name, field.title, base.DEC, nil, nil, field.about) end,
  }
  for _, name in ipairs(order) do
    kelvasi.types[name] = wanted[name].kind
    kelvasi.fields[name] = makers[wanted[name].kind](name, wanted[name])
  end
  local function add(name, title, kind, ...) kelvasi.fields[name] = ProtoField[kind](name, title, ...) end
  add("kelvasi.code", "Log code", "uint24", base.HEX)
  add("kelvasi.time", "Time stamp of the baseband", "absolute_time", base.UTC)
  add("kelvasi.prefix", "Prefix", "bytes")
  add("kelvasi.fields", "Fields", "none")
  add("kelvasi.plist", "Property list", "none")
  add("kelvasi.plist.boolean", "Boolean", "bool")
  add("kelvasi.plist.integer", "Integer", "int64")
  add("kelvasi.plist.unsigned", "Integer", "uint64")
  add("kelvasi.plist.data", "Data", "bytes")

  for _, row in ipairs(rows) do
    row.own, row.own_kind = kelvasi.fields[row.own_name], kelvasi.types[row.own_name]
    row.words = kelvasi.fields[row.words_name]
    row.number, row.number_kind = kelvasi.fields[row.number_name], kelvasi.types[row.number_name]
  end

  local group, severity = expert.group, expert.severity
  for name, sort in pairs({
    no_record = {"Shorter than the header of a record", group.MALFORMED, severity.WARN},
    too_short = {"Record too short", group.MALFORMED, severity.WARN},
    not_understood = {"Not the record that is known", group.MALFORMED, severity.WARN},
    beyond = {"Entry past the end of the record", group.MALFORMED, severity.WARN},
    no_plist = {"Not a property list", group.MALFORMED, severity.WARN},
    wrong_length = {"Length is not the record's", group.PROTOCOL, severity.NOTE},
    unknown_type = {"Unknown log type", group.UNDECODED, severity.WARN},
    unknown_code = {"Unknown log code", group.UNDECODED, severity.NOTE},
    unknown_version = {"Unknown version", group.UNDECODED, severity.WARN},
  }) do
    kelvasi.warnings[name] = sort[1]
    kelvasi.experts[name] = ProtoExpert.new("kelvasi." .. name, sort[1], sort[2], sort[3])
  end
  kelvasi.proto.fields = kelvasi.fields
  kelvasi.proto.experts = kelvasi.experts
end
