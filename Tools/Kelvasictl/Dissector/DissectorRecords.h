// SPDX-License-Identifier: Apache-2.0
// The records of the dissector: by log code their layouts, and the sections that show them.
#pragma once

#include <map>
#include <string>
#include <vector>

#include "LogGenerator/RowCatalog.h"
#include "Tools/Kelvasictl/Dissector/SharedTables.h"

namespace kelvasi {

class DissectorRecords {
 public:
  explicit DissectorRecords(SharedTables& shared) : shared_(shared) {}

  void add(const std::string& technology, const RowCatalog& catalog);
  std::string written() const;

 private:
  // Rows of one section that are read from one place.
  struct Part {
    RecordPart from;
    std::string list;  // as the display has it
    LuaTable rows;
  };
  struct Section {
    std::string name;
    std::vector<Part> parts;
  };
  struct Record {
    std::string technology;
    std::vector<std::size_t> heads;  // layouts that count from the start of the record
    std::vector<std::size_t> lists;
    std::map<std::string, std::size_t> others;  // layouts by what they count from
    std::vector<Section> sections;
  };

  void addFields(const std::string& technology, const RecordPart& part);
  void addRow(const CatalogRow& row);
  std::string written(const Part& part) const;
  std::string written(const Record& record) const;

  SharedTables& shared_;
  std::map<LogCode, Record> records_;
};

}  // namespace kelvasi
