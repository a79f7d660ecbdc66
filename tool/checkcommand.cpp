#include <cstddef>
#include <memory>
#include <sstream>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include <fmt/format.h>
#include <nlohmann/json.hpp>

#include "aldermoor/vexdoc/inspection.h"

#include "command.h"
#include "diagnostics.h"
#include "documents.h"
#include "faults.h"
#include "inputfile.h"
#include "output.h"
#include "records.h"
#include "text.h"

namespace Aldermoor::Tool {
namespace {

using nlohmann::ordered_json;
using Vexdoc::Fault;

using namespace std::string_view_literals;

// The version and the length and text of the magic, with which every cache begins.
constexpr std::string_view kCacheHead = "\5\0\0\0\20\0\0\0VEX Binary File\n"sv;

/// What a check of one file found.
struct Findings {
  explicit Findings(const std::string& file) : path(file) {
    std::string bytes = ReadBytes(file);
    is_cache = file.ends_with(".vexb") || bytes.starts_with(kCacheHead);
    std::istringstream in(std::move(bytes));
    faults = is_cache ? Vexdoc::CheckCache(in) : Vexdoc::CheckXML(in);
    if (!is_cache && file != kStandardStream && !IgnoresCaches()) {
      cache = Vexdoc::StateOfCache(Utilities::FileSystem::File(file));
    }
    for (const Fault& fault : faults) {
      (fault.severity == Fault::Severity::kError ? errors : warnings) += 1 + fault.repeats;
    }
  }

  std::string path;
  bool is_cache = false;
  Vexdoc::CacheState cache;  // of an XML file
  std::vector<Fault> faults;
  std::size_t errors = 0;
  std::size_t warnings = 0;
};

const char* Name(Fault::Severity severity) {
  return severity == Fault::Severity::kError ? "error" : "warning";
}

std::string ToText(const Findings& findings) {
  const std::string path = OnOneLine(ShownPath(findings.path));
  std::string out;
  for (const Fault& fault : findings.faults) {
    out += (findings.is_cache ? CacheFaultText : FaultText)(findings.path, fault) + "\n";
  }
  if (findings.faults.empty()) {
    return fmt::format("{}: in order\n", path);
  }
  return out + fmt::format("{}: {} fault{}, {} warning{}\n", path, findings.errors,
                           findings.errors == 1 ? "" : "s", findings.warnings,
                           findings.warnings == 1 ? "" : "s");
}

ordered_json ToJson(const Findings& findings) {
  ordered_json faults = ordered_json::array();
  for (const Fault& fault : findings.faults) {
    ordered_json item = {{"severity", Name(fault.severity)}, {"text", fault.text}};
    if (findings.is_cache) {
      item["offset"] = fault.offset;
    } else if (fault.line != 0) {
      item["line"] = fault.line;
      item["column"] = fault.column;
    }
    if (fault.repeats > 0) {
      item["repeats"] = fault.repeats;
    }
    faults.push_back(std::move(item));
  }
  ordered_json result = {{"file", findings.path},
                         {"kind", findings.is_cache ? "cache" : "xml"},
                         {"errors", findings.errors},
                         {"warnings", findings.warnings},
                         {"faults", faults}};
  if (findings.cache.exists) {
    result["cache"] = {{"used", findings.cache.is_used}, {"reason", findings.cache.reason}};
  }
  return result;
}

class CheckCommand : public Command {
 public:
  void AddOptions(CLI::App& app) override {
    inputs_.AddTo(app);
    output_.AddTo(app, "table json");
  }

  ExitStatus Run() override {
    const bool json = output_.GetFormat() == Format::kJson;
    inputs_.CheckStandardInput();
    Output output(output_.path);
    ordered_json results = ordered_json::array();
    ExitStatus status = ExitStatus::kDone;
    bool has_results = false;
    for (const std::string& path : inputs_.paths) {
      try {
        const Findings findings(path);
        has_results = true;
        // No fault of the document, which is read all the same.
        if (findings.cache.exists && !findings.cache.is_used) {
          Report(fmt::format("{}: the cache is not used: {}", path, findings.cache.reason));
        }
        if (json) {
          results.push_back(ToJson(findings));
        } else {
          output.Write(ToText(findings));
        }
        if (findings.errors > 0) {
          status = Worse(status, ExitStatus::kSomeFailed);
        }
      } catch (const InputError& e) {
        Report(e.what());
        status = Worse(status, ExitStatus::kUnreadable);
      }
    }
    if (!has_results) {
      return status;  // the old output stays
    }
    if (json) {
      const ordered_json all = {{"files", results}};
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

std::unique_ptr<Command> MakeCheckCommand() {
  return std::make_unique<CheckCommand>();
}

}  // namespace Aldermoor::Tool
