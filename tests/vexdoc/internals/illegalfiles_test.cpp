#include <map>

#include <gtest/gtest.h>
#include <xercesc/dom/DOMNode.hpp>

#include "aldermoor/utilities/exceptions/exceptions.h"
#include "aldermoor/utilities/tools/typename.h"
#include "aldermoor/vexdoc/vexexception.h"

#include "tests/vexdoc/internals/documenttext.h"
#include "tests/vexdoc/internals/loadsupport.h"

namespace Aldermoor::Vexdoc::Testing {
namespace {

using Utilities::Exceptions::TraceableException;
using Utilities::Tools::TypeName;

// A row of illegal/expected.tsv.
struct Failure {
  std::string file;
  std::string raised;  // by the parser or the loader, without namespace
  std::string line;    // "-" for what is no parse failure
  std::string column;
  std::string message;  // "\n" stands for a line feed
};

void Replace(std::string& text, const std::string& from, const std::string& to) {
  for (auto at = text.find(from); at != std::string::npos; at = text.find(from, at + to.size())) {
    text.replace(at, from.size(), to);
  }
}

std::vector<Failure> ReadList() {
  std::vector<Failure> list;
  std::istringstream rows(ReadFile(DataFile("illegal", "expected.tsv")));
  for (std::string row; std::getline(rows, row);) {
    if (row.starts_with('#')) {
      continue;
    }
    Failure failure;
    std::istringstream cells(row);
    for (std::string* cell :
         {&failure.file, &failure.raised, &failure.line, &failure.column, &failure.message}) {
      std::getline(cells, *cell, '\t');
    }
    Replace(failure.message, "\\n", "\n");
    // Names that depend on the standard library and on the version of the parser.
    Replace(failure.message, "%STRING%", TypeName<std::string>());
    Replace(failure.message, "%DOMNODE%", TypeName<xercesc::DOMNode>());
    list.push_back(failure);
  }
  return list;
}

struct Caught {
  std::string type = "nothing";
  std::string message;
  std::string file;
  std::string line = "-";
  std::string column = "-";
};

// What `load` throws, which must be a std::exception and a TraceableException at once.
template <class Load>
Caught Catch(Load load) {
  Caught caught;
  try {
    load();
  } catch (const std::exception& e) {
    caught.message = e.what();
    const auto* const traceable = dynamic_cast<const TraceableException*>(&e);
    if (traceable == nullptr) {
      caught.type = "no TraceableException";
      return caught;
    }
    caught.type = TypeName(typeid(e));
    caught.type.erase(0, caught.type.rfind(':') + 1);
    if (const auto* const parse = dynamic_cast<const VexXMLParseException*>(&e)) {
      caught.file = parse->GetFile();
      caught.line = std::to_string(parse->GetLine());
      caught.column = std::to_string(parse->GetColumn());
    }
  }
  return caught;
}

bool IsVexException(const std::string& type) {
  return type.starts_with("Vex") || type == "MissingConditionException";
}

class IllegalDocumentTest : public ::testing::TestWithParam<Failure> {};

TEST_P(IllegalDocumentTest, FailsAsListed) {
  const Failure& expected = GetParam();
  const std::filesystem::path path = DataFile("illegal", expected.file);
  const bool has_place = expected.line != "-";
  VEX document("earlier name");
  document.AddSample("earlier set", Sample("earlier sample"));
  const std::string earlier = DocumentText(document);

  const Caught file = Catch([&] { LoadFile(document, path); });
  EXPECT_EQ(file.type, IsVexException(expected.raised) ? expected.raised : "VexException");
  EXPECT_EQ(file.message, expected.message);
  EXPECT_EQ(file.line, expected.line);
  EXPECT_EQ(file.column, expected.column);
  EXPECT_EQ(file.file, has_place ? path.string() : "");
  EXPECT_EQ(DocumentText(document), earlier);

  const Caught stream = Catch([&] { LoadText(document, ReadFile(path)); });
  if (!IsVexException(expected.raised)) {
    EXPECT_EQ(stream.type, expected.raised);
    EXPECT_EQ(stream.message, expected.message);
  } else {
    EXPECT_EQ(stream.type, has_place ? "VexXMLParseException" : "VexException");
    EXPECT_EQ(stream.message, "An error occurred during parsing a Stream:\n" + expected.message);
  }
  EXPECT_EQ(stream.line, expected.line);
  EXPECT_EQ(stream.column, expected.column);
  EXPECT_EQ(stream.file, has_place ? "VEX" : "");
  EXPECT_EQ(document.Size(), 0U) << "no children are left";
}

INSTANTIATE_TEST_SUITE_P(Corpus, IllegalDocumentTest, ::testing::ValuesIn(ReadList()),
                         [](const auto& param) {
                           return param.param.file.substr(0, param.param.file.find('.'));
                         });

TEST(IllegalCorpusTest, ListNamesEveryFileOnce) {
  std::vector<std::string> listed;
  for (const Failure& failure : ReadList()) {
    listed.push_back(failure.file.substr(0, failure.file.find('.')));
  }
  std::sort(listed.begin(), listed.end());
  EXPECT_EQ(listed, XmlFiles("illegal"));
}

TEST(IllegalCorpusTest, DocumentLoadsAfterFailures) {
  VEX document;
  for (const char* name : {"entity_bomb.xml", "tag_not_closed.xml", "nested_too_deep.xml"}) {
    EXPECT_THROW(LoadFile(document, DataFile("illegal", name)), VexXMLParseException);
  }
  LoadFile(document, DataFile("legal", "recipes.xml"));
  EXPECT_EQ(document.GetName(), "recipes");
}

}  // namespace
}  // namespace Aldermoor::Vexdoc::Testing
