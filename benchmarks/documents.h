#ifndef ALDERMOOR_BENCHMARKS_DOCUMENTS_H
#define ALDERMOOR_BENCHMARKS_DOCUMENTS_H

#include <string>

namespace Aldermoor::Benchmarks {

/// A document to load: its text and the file that holds the same bytes.
struct Document {
  std::string name;
  std::string path;
  std::string text;
};

/// Texts as a writer that indents would write them, with all the time stamps that elements carry.
/// One set of `count` samples, each with one spectrum of 36 bands under shared conditions.
std::string SamplesText(unsigned count);
/// "10,000 samples" for 10000, which must be whole thousands.
std::string SamplesName(unsigned count);
/// `count` values of the root's header in "AdditionalData".
std::string HeaderValuesText(unsigned count);
/// One block of `count` condition attributes.
std::string ConditionsText(unsigned count);

/// A directory for the files of one run, removed with this object.
class Workspace {
 public:
  /// Throws: std::runtime_error if the directory cannot be made.
  Workspace();
  Workspace(const Workspace&) = delete;
  Workspace& operator=(const Workspace&) = delete;
  ~Workspace();

  /// Throws: std::runtime_error if the file cannot be written.
  Document Keep(const std::string& name, std::string text) const;
  /// The path of a file in the directory; blanks and commas of `name` are replaced.
  std::string PathOf(const std::string& name) const;

 private:
  std::string path_;
};

/// Throws: std::runtime_error if the file cannot be read.
std::string ReadFile(const std::string& path);

}  // namespace Aldermoor::Benchmarks

#endif  // ALDERMOOR_BENCHMARKS_DOCUMENTS_H
