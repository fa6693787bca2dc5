// SPDX-License-Identifier: Apache-2.0
#include "Cockpit/Rows/Search.h"

#include <algorithm>
#include <optional>

#include "Cockpit/Rows/RowPath.h"
#include "Cockpit/Serving/CellWords.h"

namespace kelvasi::cockpit {

namespace {

char lower(char character) {
  return character >= 'A' && character <= 'Z' ? static_cast<char>(character - 'A' + 'a') : character;
}

std::string lowered(std::string text) {
  std::ranges::transform(text, text.begin(), lower);
  return text;
}

std::vector<std::string> wordsIn(const std::string& text) {
  std::vector<std::string> words;
  std::string word;
  for (const char character : text + " ") {
    if (character != ' ' && character != '\t') {
      word += character;
    } else if (!word.empty()) {
      words.push_back(std::move(word));
      word.clear();
    }
  }
  return words;
}

struct Hit {
  int rank = 0;
  const RowBook::Rows::value_type* row = nullptr;
};

class Query {
 public:
  explicit Query(std::string_view text) : words_(wordsIn(lowered(std::string(text)))) {
    for (const std::string& word : words_) text_ += (text_.empty() ? "" : " ") + word;
  }
  bool isEmpty() const { return words_.empty(); }

  // The lower the better; nothing for a row that is not meant.
  std::optional<int> rank(const RowBook::Rows::value_type& entry) const {
    const std::string name = lowered(rowNameOf(entry.first));
    if (name == "_sorted") return std::nullopt;
    const std::string place = lowered(placeTextOf(entry.first));
    const std::string value = lowered(entry.second.text());
    const std::string cell = lowered(fullCellName(entry.second.cell) + " " + cellName(entry.second.cell));
    const auto has = [](const std::string& in, const std::string& what) {
      return in.find(what) != std::string::npos;
    };
    const bool isMeant = std::ranges::all_of(words_, [&](const std::string& word) {
      return has(name, word) || has(place, word) || has(value, word) || has(cell, word);
    });
    if (!isMeant) return std::nullopt;
    if (name == text_) return 0;
    if (name.starts_with(text_)) return 1;
    if (has(name, text_)) return 2;
    if (std::ranges::any_of(words_, [&](const std::string& word) { return has(name, word); })) return 3;
    return has(place, text_) ? 4 : 5;
  }

 private:
  std::vector<std::string> words_;
  std::string text_;
};

Found foundOf(const RowBook::Rows::value_type& entry, Arrival now) {
  const auto& [path, row] = entry;
  return {.path = path,
          .nodePath = nodePathOf(path),
          .name = rowNameOf(path),
          .place = placeTextOf(path),
          .value = row.text(),
          .cellText = fullCellName(row.cell),
          .age = ageOf(row.last, now)};
}

std::string wordsOf(const SearchResult& result) {
  if (result.matches == 0) return "No row with this name or value";
  if (result.matches == 1) return "1 row";
  if (result.rows.size() == result.matches) return std::to_string(result.matches) + " rows";
  return std::to_string(result.rows.size()) + " of " + std::to_string(result.matches) + " rows";
}

}  // namespace

SearchResult search(const RowBook& book, std::string_view text, Arrival now, std::size_t most) {
  SearchResult result;
  const Query query(text);
  if (query.isEmpty()) return result;
  std::vector<Hit> hits;
  for (const auto& entry : book.all()) {
    if (!entry.second.isPresent) continue;
    if (const auto rank = query.rank(entry)) hits.push_back({*rank, &entry});
  }
  std::ranges::stable_sort(hits, {}, &Hit::rank);
  result.matches = hits.size();
  for (const Hit& hit : hits) {
    if (result.rows.size() == most) break;
    result.rows.push_back(foundOf(*hit.row, now));
  }
  result.words = wordsOf(result);
  return result;
}

}  // namespace kelvasi::cockpit
