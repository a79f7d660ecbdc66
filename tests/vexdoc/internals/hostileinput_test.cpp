#include <functional>
#include <thread>

#include <gtest/gtest.h>
#include <malloc.h>
#include <sys/stat.h>
#include <unistd.h>

#include "aldermoor/utilities/exceptions/exceptions.h"
#include "aldermoor/vexdoc/conditions.h"
#include "aldermoor/vexdoc/vexexception.h"

#include "tests/vexdoc/internals/documenttext.h"
#include "tests/vexdoc/internals/loadsupport.h"

namespace Aldermoor::Vexdoc::Testing {
namespace {

using Utilities::Exceptions::TraceableException;

// All kinds of attributes in 2 kB.
std::string AllKinds() {
  return ReadFile(DataFile("legal", "all_kinds.xml"));
}

TEST(HostileInputTest, DocumentCutAnywhereIsAParseFailureWithItsPlace) {
  const std::string text = AllKinds();
  const std::size_t whole = text.find("</VEX>") + 6;
  const TemporaryDirectory directory;
  const std::filesystem::path path = directory / "Größe 色 \xF0\x9F\x98\x80.xml";  // UTF-8
  for (std::size_t length = 0; length <= text.size(); ++length) {
    WriteFile(path, text.substr(0, length));
    for (const std::string& file : {std::string("VEX"), path.string()}) {
      VEX document;
      try {
        file == "VEX" ? LoadText(document, ReadFile(path)) : LoadFile(document, path);
        EXPECT_GE(length, whole) << "part of a text gave a document";
      } catch (const VexXMLParseException& e) {
        EXPECT_LT(length, whole) << e.what();
        EXPECT_EQ(e.GetFile(), file) << length;
        EXPECT_GE(e.GetLine(), 1U) << length;
        EXPECT_GE(e.GetColumn(), 1U) << length;
      }
    }
  }
}

TEST(HostileInputTest, AnyByteReplacedIsADocumentOrATraceableFailure) {
  const std::string text = AllKinds();
  std::size_t failures = 0;
  ::testing::internal::CaptureStdout();  // some of them are warnings
  for (std::size_t i = 0; i < text.size(); ++i) {
    for (const int byte : {0x00, 0xFF, ~text[i] & 0xFF}) {
      std::string damaged = text;
      damaged[i] = static_cast<char>(byte);
      VEX document;
      try {
        LoadText(document, damaged);
      } catch (const std::exception& e) {
        ++failures;
        EXPECT_NE(dynamic_cast<const TraceableException*>(&e), nullptr) << i << ": " << e.what();
        EXPECT_EQ(document.Size(), 0U) << i;
      }
    }
  }
  ::testing::internal::GetCapturedStdout();
  // 0x00 and 0xFF are no characters of XML at any place.
  EXPECT_GE(failures, 2 * text.size());
}

std::string Repeated(const std::string& text, int count) {
  std::string result;
  for (int i = 0; i < count; ++i) {
    result += text;
  }
  return result;
}

std::string Numbered(const std::string& before, const std::string& after, int count) {
  std::string result;
  for (int i = 0; i < count; ++i) {
    result += before + std::to_string(i) + after;
  }
  return result;
}

std::string Document(const std::string& subset, const std::string& body) {
  return (subset.empty() ? "" : "<!DOCTYPE VEX [" + subset + "]>") +
         "<VEX Version='1'><Name>n</Name>" + body + "</VEX>";
}

// The text of the failure, behind what every failure of a stream begins with; "" if there is none.
std::string FailureOfText(const std::string& text) {
  const std::string prefix = "An error occurred during parsing a Stream:\n";
  VEX document;
  try {
    LoadText(document, text);
  } catch (const VexException& e) {
    EXPECT_EQ(document.Size(), 0U);
    EXPECT_TRUE(std::string(e.what()).starts_with(prefix)) << e.what();
    return e.what() + prefix.size();
  }
  return "";
}

TEST(HostileInputTest, AHundredThousandOfAKindLoad) {
  constexpr int kMany = 100000;
  VEX document;
  LoadText(document, Document("", "<AdditionalData>" + Numbered("<V N='k", "'>v</V>", kMany) +
                                      "</AdditionalData><SampleSet><Name>s</Name><Sample><Name>t"
                                      "</Name><SampleAttribute><Recipe Conditions='1'/>"
                                      "</SampleAttribute></Sample>" +
                                      Numbered("<Sample><Name>", "</Name></Sample>", kMany) +
                                      "</SampleSet><Conditions><ID>1</ID>" +
                                      Numbered("<A N='k", "'>v</A>", kMany) + "</Conditions>"));
  // Beside the name and the two time stamps.
  EXPECT_EQ(document.GetAttributes().size(), kMany + 3U);
  EXPECT_EQ(document.GetAttribute("k99999"), "v");
  EXPECT_EQ(document.GetSampleSet("s")->Size(), kMany + 1U);
  EXPECT_EQ(document.GetSampleSet("s")->GetElements().back().first, "99999");
  const auto recipe = document.FindSample("s", "t")->GetElements().front().second;
  EXPECT_EQ(recipe->GetConditions()->GetAttributes().size(), std::size_t{kMany});
}

struct Limit {
  const char* failure;
  std::function<std::string(int)> text;
  int most;  // what still loads; one more is refused
};

TEST(HostileInputTest, LimitsAreReachedAndNotPassed) {
  const auto declarations = [](const char* before, const char* after) {
    return [=](int count) {
      return Document(Numbered(before, after, count), "");
    };
  };
  const char* const many_declarations = "The document type makes more than 1000 declarations";
  const Limit limits[] = {
      {"Elements nest deeper than 256 levels",
       [](int levels) {
         return Document("", Repeated("<a>", levels - 1) + Repeated("</a>", levels - 1));
       },
       256},
      {"There are more than 32768 different names of elements",
       [](int names) { return Document("", Numbered("<a", "/>", names - 2)); }, 32768},
      {"Entity 'a' is longer than 4096 characters",
       [](int length) { return Document("<!ENTITY a '" + Repeated("x", length) + "'>", "&a;"); },
       4096},
      {"parser has encountered more than '1000' entity expansions in the document; this is the "
       "limit imposed by the application",
       [](int references) { return Document("<!ENTITY a 'x'>", Repeated("&a;", references)); },
       1000},
      {many_declarations, declarations("<!ENTITY e", " 'x'>"), 1000},
      {many_declarations, declarations("<!ELEMENT e", " EMPTY>"), 1000},
      {many_declarations, declarations("<!NOTATION n", " PUBLIC 'p'>"), 1000},
      {many_declarations, declarations("<!ATTLIST a", " b CDATA 'x'>"), 1000}};
  for (const Limit& limit : limits) {
    SCOPED_TRACE(limit.text(3));
    EXPECT_EQ(FailureOfText(limit.text(limit.most)), "");
    EXPECT_EQ(FailureOfText(limit.text(limit.most + 1)),
              std::string("Fatal error while parsing XML\n") + limit.failure);
  }
}

struct Growth {
  const char* name;
  std::string subset;  // of the DTD
  std::string body;
  const char* failure;  // a part of it; "" if the text loads
};

std::string Laughs(int levels, const std::string& laugh = "lol") {
  std::string text = "<!ENTITY l0 '" + laugh + "'>";
  for (int i = 1; i <= levels; ++i) {
    text += "<!ENTITY l" + std::to_string(i) + " '" +
            Repeated("&l" + std::to_string(i - 1) + ";", 10) + "'>";
  }
  return text;
}

constexpr char kExpansions[] = "more than '1000' entity expansions";
constexpr char kLongEntity[] = "is longer than 4096 characters";
constexpr char kMemory[] = "takes more memory";

// The last ones are as small as shows a fault: larger texts would stop the test run.
std::vector<Growth> GrowingTexts() {
  return {
      {"bomb", Laughs(9), "&l9;", kLongEntity},
      {"flat bomb", Laughs(2), Repeated("&l2;", 11), kExpansions},
      {"flat bomb in an attribute", Laughs(2), "<a b='" + Repeated("&l2;", 11) + "'/>",
       kExpansions},
      {"bomb in the default of an attribute",
       Laughs(5, std::string(300, 'x')) + "<!ATTLIST a b CDATA '&l5;'>", "", kLongEntity},
      {"long default of an attribute", "<!ATTLIST a b CDATA '" + std::string(20000, 'x') + "'>",
       Repeated("<a/>", 3000), kMemory},
      {"many defaults of attributes", "<!ATTLIST a " + Numbered("b", " CDATA ''", 1000) + ">",
       Repeated("<a/>", 300), kMemory},
      {"many states of a content model",
       "<!ELEMENT VEX (Name,w)><!ATTLIST VEX Version CDATA ''><!ELEMENT Name (#PCDATA)>"
       "<!ELEMENT w ((a|b)*,a" +
           Repeated(",(a|b)", 18) + ")><!ELEMENT a EMPTY><!ELEMENT b EMPTY>",
       "<w>" + Repeated("<a/><b/>", 20) + "</w>", ""},
      {"parameter entity used often",
       "<!ENTITY % p '" + Repeated("<?a b?>", 585) + "'>" + Repeated("%p;", 6000), "",
       "Parameter entity 'p' is not read"},
  };
}

// The most memory that the process held since the last reset, in kB.
long PeakKilobytes() {
  std::ifstream status("/proc/self/status");
  for (std::string word; status >> word;) {
    if (word == "VmHWM:") {
      long kilobytes = 0;
      status >> kilobytes;
      return kilobytes;
    }
  }
  return -1;
}

#if defined(__SANITIZE_ADDRESS__)
constexpr long kMostGrowth = 512 * 1024L;  // what is freed stays in quarantine
#else
constexpr long kMostGrowth = 64 * 1024L;
#endif

TEST(HostileInputTest, SmallTextTakesLittleMemory) {
  for (const Growth& growth : GrowingTexts()) {
    SCOPED_TRACE(growth.name);
    const std::string text = Document(growth.subset, growth.body);
    EXPECT_LT(text.size(), 100000U);
    malloc_trim(0);
    std::ofstream("/proc/self/clear_refs") << "5";  // resets the peak
    const long before = PeakKilobytes();
    ASSERT_GT(before, 0);
    const std::string failure = FailureOfText(text);
    EXPECT_LT(PeakKilobytes() - before, kMostGrowth);
    if (growth.failure == kMemory) {
      const std::size_t most = (32U << 20U) + 128 * text.size();
      EXPECT_EQ(failure, "The document takes more memory than the " + std::to_string(most) +
                             " bytes that a text of " + std::to_string(text.size()) +
                             " bytes may take");
    } else {
      EXPECT_NE(failure.find(growth.failure), std::string::npos) << failure;
      EXPECT_EQ(failure.empty(), std::string(growth.failure).empty()) << failure;
    }
  }
}

// A file that cannot be read is told by its path, and the document stays as it was.
void ExpectNotAccessable(const std::filesystem::path& path) {
  VEX document("kept");
  document.AddSampleSet("set");
  try {
    LoadFile(document, path);
    FAIL() << "nothing was thrown";
  } catch (const VexException& e) {
    EXPECT_EQ(dynamic_cast<const VexParseException*>(&e), nullptr);
    EXPECT_EQ(e.what(), "file '" + path.string() + "' not accessable ");
  }
  EXPECT_EQ(DocumentText(document), "VEX 'kept'\n VEXSampleSet 'set'\n");
}

// Gives up the rights of root, to which every file is readable, for a scope.
class Unprivileged {
 public:
  Unprivileged() : user_(geteuid()) {
    if (user_ == 0) {
      EXPECT_EQ(seteuid(65534), 0);
    }
  }
  Unprivileged(const Unprivileged&) = delete;
  Unprivileged& operator=(const Unprivileged&) = delete;
  ~Unprivileged() { EXPECT_EQ(seteuid(user_), 0); }

 private:
  uid_t user_;
};

TEST(UnreadableFileTest, IsToldByItsPath) {
  const TemporaryDirectory directory;
  const std::filesystem::path folder = directory / "folder.xml";
  std::filesystem::create_directory(folder);
  ExpectNotAccessable(directory / "missing.xml");
  ExpectNotAccessable(folder);
  ExpectNotAccessable(folder / "missing.xml");
  const std::filesystem::path secret = directory / "secret.xml";
  WriteFile(secret, Document("", ""));
  chmod((directory / "").c_str(), 0755);
  chmod(secret.c_str(), 0000);
  const Unprivileged scope;
  ExpectNotAccessable(secret);
}

// What is wanted a second time by the second parse has to be kept.
TEST(PipeTest, ADocumentIsReadFromAPipeWithThePlacesOfItsFaults) {
  const TemporaryDirectory directory;
  const std::filesystem::path path = directory / "pipe.xml";
  ASSERT_EQ(mkfifo(path.c_str(), 0600), 0);
  VEX document;
  const auto load = [&](const std::string& text) {
    std::thread writer([&] { WriteFile(path, text); });
    try {
      LoadFile(document, path);
    } catch (...) {
      writer.join();
      throw;
    }
    writer.join();
  };
  load("<!DOCTYPE VEX><VEX Version='1'><Name>" + std::string(200000, 'n') + "</Name></VEX>");
  EXPECT_EQ(document.GetName().size(), 200000U);
  try {
    load("<VEX Version='1'>\n<Name>n</VEX>");
    FAIL() << "nothing was thrown";
  } catch (const VexXMLParseException& e) {
    EXPECT_EQ(e.GetFile(), path.string());
    EXPECT_EQ(e.GetLine(), 2U);
  }
}

}  // namespace
}  // namespace Aldermoor::Vexdoc::Testing
