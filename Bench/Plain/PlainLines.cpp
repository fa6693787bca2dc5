// SPDX-License-Identifier: Apache-2.0
// Prints lines of `kelvasictl readings` again with snprintf: what a plain program takes that knows all values
// beforehand and only prints them. `plain_lines ndjson|csv FILE` prints the processor seconds that took.
#include <cstdio>
#include <cstdlib>
#include <ctime>
#include <fstream>
#include <nlohmann/json.hpp>
#include <string>
#include <string_view>
#include <vector>

namespace {

constexpr const char* names[] = {"time", "technology", "code",  "path", "section", "row",
                                 "cell", "text",       "value", "unit", "quantity"};
constexpr std::size_t valueAt = 8;
constexpr int digits = 17;

struct Line {
  std::string texts[std::size(names)];
  double value = 0;
  bool hasNumber = false;
};

Line lineOf(const nlohmann::json& reading) {
  Line line;
  for (std::size_t at = 0; at < std::size(names); ++at) {
    const auto& field = reading.at(names[at]);
    if (field.is_string()) line.texts[at] = field.get<std::string>();
    if (at != valueAt || !field.is_number()) continue;
    line.value = field.get<double>();
    line.hasNumber = true;
  }
  return line;
}

std::vector<Line> linesOf(const char* path) {
  std::ifstream file(path);
  std::vector<Line> lines;
  for (std::string text; std::getline(file, text);) lines.push_back(lineOf(nlohmann::json::parse(text)));
  return lines;
}

struct Form {
  std::string_view name;
  bool hasNames;
};
constexpr Form forms[] = {{"ndjson", true}, {"csv", false}};

int printText(char* to, std::size_t room, const Form& form, std::size_t at, const std::string& text) {
  if (form.hasNames)
    return std::snprintf(to, room, R"(%c"%s":"%s")", at == 0 ? '{' : ',', names[at], text.c_str());
  return std::snprintf(to, room, "%s%s", at == 0 ? "" : ",", text.c_str());
}

int printNumber(char* to, std::size_t room, const Form& form, double number) {
  if (form.hasNames) return std::snprintf(to, room, R"(,"%s":%.*g)", names[valueAt], digits, number);
  return std::snprintf(to, room, ",%.*g", digits, number);
}

void print(const Line& line, const Form& form, std::FILE* output) {
  char text[4096];
  std::size_t size = 0;
  for (std::size_t at = 0; at < std::size(names); ++at) {
    const std::size_t room = sizeof text - size;
    const bool isNumber = at == valueAt && line.hasNumber;
    const int length = isNumber ? printNumber(text + size, room, form, line.value)
                                : printText(text + size, room, form, at, line.texts[at]);
    if (length < 0 || static_cast<std::size_t>(length) >= room) return;
    size += static_cast<std::size_t>(length);
  }
  std::fwrite(text, 1, size, output);
  std::fputs(form.hasNames ? "}\n" : "\n", output);
}

}  // namespace

int main(int count, char** arguments) {
  const Form* form = nullptr;
  for (const Form& each : forms) {
    if (count == 3 && each.name == arguments[1]) form = &each;
  }
  std::FILE* output = std::fopen("/dev/null", "w");
  if (!form || !output) {
    std::fprintf(stderr, "usage: %s ndjson|csv FILE\n", arguments[0]);
    return EXIT_FAILURE;
  }
  const std::vector<Line> lines = linesOf(arguments[2]);
  const std::clock_t begin = std::clock();
  for (const Line& line : lines) print(line, *form, output);
  std::printf("%.6f\n", static_cast<double>(std::clock() - begin) / CLOCKS_PER_SEC);
  std::fclose(output);
}
