#include <algorithm>
#include <cstddef>
#include <map>
#include <memory>
#include <string>
#include <vector>

#include <fmt/format.h>
#include <nlohmann/json.hpp>

#include "aldermoor/vexdoc/conditions.h"
#include "aldermoor/vexdoc/vex.h"

#include "command.h"
#include "documents.h"
#include "output.h"
#include "records.h"
#include "text.h"

namespace Aldermoor::Tool {
namespace {

using nlohmann::ordered_json;

/// A condition block and how many attributes stand under it.
struct Block {
  Vexdoc::Conditions conditions;
  std::size_t uses = 0;
};

/// What there is to say about one document.
struct Summary {
  Summary(const Vexdoc::VEX& document, const Vexdoc::LoadReport& report)
      : header(document.GetAttributes()),
        contradictions(report.contradictions),
        contradiction_count(report.contradiction_count) {
    for (const auto& [name, set] : document.GetSampleSets()) {
      sets.emplace_back(name, set->GetSamples().size());
      samples += set->GetSamples().size();
      for (const auto& [sample_name, sample] : set->GetSamples()) {
        for (const auto& [attribute_name, attribute] : sample->GetElements()) {
          Count(*attribute);
        }
      }
    }
  }

  std::map<std::string, std::string> header;
  std::vector<std::pair<std::string, std::size_t>> sets;  // with the number of samples
  std::size_t samples = 0;
  std::map<std::string, std::size_t> kinds;
  std::vector<Block> blocks;  // in the order in which the document uses them
  std::vector<Vexdoc::LoadReport::Contradiction> contradictions;
  std::size_t contradiction_count = 0;

 private:
  void Count(const Vexdoc::SampleAttribute& attribute) {
    ++kinds[attribute.GetType().substr(3)];  // without "VEX"
    const Vexdoc::Conditions* const conditions = attribute.GetConditions().Get();
    if (conditions == nullptr) {
      return;
    }
    const auto [found, is_new] = places_.try_emplace(conditions, blocks.size());
    if (is_new) {
      blocks.push_back({*conditions, 0});
    }
    ++blocks[found->second].uses;
  }

  std::map<const Vexdoc::Conditions*, std::size_t> places_;
};

std::string Count(std::size_t number, const char* noun) {
  return fmt::format("{} {}{}", number, noun, number == 1 ? "" : "s");
}

void AppendPairs(std::string& out, const char* indent,
                 const std::map<std::string, std::string>& pairs) {
  std::size_t width = 0;
  for (const auto& [key, value] : pairs) {
    width = std::max(width, DisplayWidth(OnOneLine(key)));
  }
  for (const auto& [key, value] : pairs) {
    const std::string shown = OnOneLine(key);
    out += indent + shown + std::string(width - DisplayWidth(shown) + 2, ' ') + OnOneLine(value);
    out += '\n';
  }
}

void AppendContradictions(std::string& out, const Summary& summary) {
  constexpr std::size_t kMostShown = 10;
  if (summary.contradictions.empty()) {
    return;
  }
  out += "  wavelengths that are not those of the conditions\n";
  const std::size_t shown = std::min(kMostShown, summary.contradictions.size());
  for (std::size_t i = 0; i < shown; ++i) {
    out += "    " + OnOneLine(summary.contradictions[i].Text()) + "\n";
  }
  if (summary.contradiction_count > shown) {
    out += fmt::format("    and {} more\n", summary.contradiction_count - shown);
  }
}

std::string ToText(const std::string& path, const Summary& summary) {
  std::string out = OnOneLine(path) + "\n";
  AppendPairs(out, "  ", summary.header);
  out += fmt::format("  {}, {}\n", Count(summary.sets.size(), "set"),
                     Count(summary.samples, "sample"));
  for (const auto& [name, count] : summary.sets) {
    out += fmt::format("    {}: {}\n", OnOneLine(name), Count(count, "sample"));
  }
  out += "  attributes\n";
  for (const auto& [kind, count] : summary.kinds) {
    out += fmt::format("    {}: {}\n", kind, count);
  }
  std::size_t number = 0;
  for (const Block& block : summary.blocks) {
    out += fmt::format("  conditions {}, used by {}{}\n", ++number, Count(block.uses, "attribute"),
                       block.conditions.HasCustomIllumination() ? ", with an illuminant" : "");
    AppendPairs(out, "    ", block.conditions.GetAttributes());
  }
  AppendContradictions(out, summary);
  return out;
}

ordered_json ToJson(const std::string& path, const Summary& summary) {
  ordered_json sets = ordered_json::array();
  for (const auto& [name, count] : summary.sets) {
    sets.push_back({{"name", name}, {"samples", count}});
  }
  ordered_json blocks = ordered_json::array();
  for (const Block& block : summary.blocks) {
    blocks.push_back({{"uses", block.uses},
                      {"customIllumination", block.conditions.HasCustomIllumination()},
                      {"attributes", block.conditions.GetAttributes()}});
  }
  ordered_json spectra = ordered_json::array();
  for (const auto& one : summary.contradictions) {
    spectra.push_back({{"set", one.set}, {"sample", one.sample}, {"text", one.text}});
  }
  return {{"file", path},
          {"header", summary.header},
          {"sets", sets},
          {"samples", summary.samples},
          {"attributes", summary.kinds},
          {"conditions", blocks},
          {"contradictions", {{"count", summary.contradiction_count}, {"spectra", spectra}}}};
}

class InfoCommand : public Command {
 public:
  void AddOptions(CLI::App& app) override {
    inputs_.AddTo(app);
    output_.AddTo(app, "table json");
  }

  ExitStatus Run() override {
    const bool json = output_.GetFormat() == Format::kJson;
    inputs_.CheckStandardInput();
    Output output(output_.path);
    std::size_t documents = 0;
    ordered_json results = ordered_json::array();
    // What other commands refuse can be looked at here.
    const ExitStatus status = inputs_.ForEachDocument(
        [&](const std::string& path, const Vexdoc::VEX& document,
            const Vexdoc::LoadReport& report) {
          const Summary summary(document, report);
          if (json) {
            results.push_back(ToJson(path, summary));
          } else {
            output.Write((documents == 0 ? "" : "\n") + ToText(path, summary));
          }
          ++documents;
        },
        Vexdoc::WavelengthUse::kReport);
    if (documents == 0) {
      return status;  // the old output stays
    }
    if (json) {
      const ordered_json all = {{"documents", results}};
      output.Write(all.dump(2, ' ', false, ordered_json::error_handler_t::replace) + "\n");
    }
    output.Commit();
    return status;
  }

 private:
  InputOptions inputs_;
  OutputOptions output_;
};

}  // namespace

std::unique_ptr<Command> MakeInfoCommand() {
  return std::make_unique<InfoCommand>();
}

}  // namespace Aldermoor::Tool
