#include "aldermoor/vexdoc/internals/nodeholder.h"

#include <array>
#include <bit>
#include <cstdint>
#include <cstdio>
#include <limits>
#include <locale>
#include <random>
#include <sstream>

#include <gtest/gtest.h>
#include <xercesc/dom/DOMDocument.hpp>
#include <xercesc/framework/MemBufInputSource.hpp>

#include "aldermoor/utilities/exceptions/exceptions.h"
#include "aldermoor/vexdoc/internals/documentparser.h"
#include "aldermoor/vexdoc/internals/xerceshelper.h"
#include "aldermoor/vexdoc/vexexception.h"

namespace Aldermoor::Vexdoc::Internals {
namespace {

using Utilities::Exceptions::NullPointerException;

// Keeps the parser, which owns the nodes.
class ParsedText {
 public:
  explicit ParsedText(const std::string& text) {
    const xercesc::MemBufInputSource source(reinterpret_cast<const XMLByte*>(text.data()),
                                            text.size(), "test");
    parser_.setValidationScheme(xercesc::XercesDOMParser::Val_Never);
    parser_.parse(source);
  }
  NodeHolder Root() { return NodeHolder(parser_.getDocument()).FindChild("*", true); }

 private:
  ParseBudget budget_{0};
  DocumentParser parser_{budget_};
};

TEST(NodeHolderTest, SearchesTakeTheFirstElementOfTheName) {
  ParsedText text("<r>x<!--b--><a i='1'/><?b c?><b i='2'/><a i='3'><b i='4'/></a><b i='5'/></r>");
  const NodeHolder root = text.Root();
  const auto number = [](const NodeHolder& holder) {
    std::string name = "i";
    std::string value = "none";
    holder.GetAttribute(name, value);
    return value;
  };
  EXPECT_EQ(number(root.FindChild("*", true)), "1");
  EXPECT_EQ(number(root.FindChild("b", true)), "2");
  EXPECT_EQ(number(root.FindChild("a", true).FindByName("a", true)), "1");
  EXPECT_EQ(number(root.FindChild("a", true).NextSibling("*", true)), "2");
  EXPECT_EQ(number(root.FindChild("a", true).NextSibling("a", true)), "3");
  EXPECT_EQ(number(root.FindChild("a", true).NextSibling("a", true).FindChild("b", true)), "4");
  EXPECT_TRUE(root.FindChild("A", false).IsNull());
  EXPECT_TRUE(root.FindChild("", false).IsNull());
  EXPECT_TRUE(root.FindChild("#text", false).IsNull());
  EXPECT_TRUE(root.FindChild("b", true).FindChild("*", false).IsNull());
}

TEST(NodeHolderTest, MissingMandatoryNodeIsNamedInTheFailure) {
  ParsedText text("<r/>");
  try {
    text.Root().FindChild("Größe", true);
    FAIL() << "nothing was thrown";
  } catch (const VexException& e) {
    EXPECT_STREQ(e.what(), "Mandatory ELEMENT child node Größe not found");
  }
}

TEST(NodeHolderTest, NullHolderFailsInEverythingButFindByName) {
  const NodeHolder null(nullptr);
  EXPECT_THROW(null.FindByName("a", true), VexException);
  std::string name;
  std::string value;
  EXPECT_TRUE(null.FindByName("*", false).IsNull());
  EXPECT_THROW(null.GetXMLNode(), NullPointerException);
  EXPECT_THROW(null.FindChild("a", false), NullPointerException);
  EXPECT_THROW(null.NextSibling("a", false), NullPointerException);
  EXPECT_THROW(null.GetAttribute(name, value), NullPointerException);
  EXPECT_THROW(null.GetText(), NullPointerException);
  EXPECT_THROW(null.GetFloat(), NullPointerException);
}

TEST(NodeHolderTest, GetAttributeLeavesTheStringsAloneIfThereIsNone) {
  ParsedText text("<r><plain/>text<other A='x'/></r>");
  const NodeHolder plain = text.Root().FindChild("plain", true);
  for (const auto& [holder, asked] :
       {std::pair(plain, ""), std::pair(plain, "Version"),
        std::pair(plain.NextSibling("other", true), "Version"),
        std::pair(NodeHolder(plain.GetXMLNode().getNextSibling()), ""),
        std::pair(NodeHolder(text.Root().GetXMLNode().getOwnerDocument()), "")}) {
    std::string name = asked;
    std::string value = "kept";
    EXPECT_FALSE(holder.GetAttribute(name, value));
    EXPECT_EQ(name, asked);
    EXPECT_EQ(value, "kept");
  }
}

TEST(NodeHolderTest, GetAttributeWithoutNameGivesTheFirstOne) {
  ParsedText text("<r B='2' A=''/>");
  std::string name;
  std::string value = "x";
  EXPECT_TRUE(text.Root().GetAttribute(name, value));
  EXPECT_EQ(name, "A");  // the parser keeps attributes in the order of their names
  EXPECT_EQ(value, "");
}

TEST(NodeHolderTest, TextIsTheFirstRunOnly) {
  constexpr std::pair<const char*, const char*> kCases[] = {
      {"<r/>", ""},
      {"<r> a b </r>", " a b "},
      {"<r>a<b>c</b>d</r>", "a"},
      {"<r><b>c</b>d</r>", "d"},
      {"<r>a<!-- -->b</r>", "a"},
      {"<r><![CDATA[a]]></r>", ""},
      {"<r>1&#50;&lt;3</r>", "12<3"},
      {"<!DOCTYPE r [<!ENTITY e 'x'>]><r>a&e;b</r>", "axb"},
      {"<r>\xF0\x9F\x98\x80\xC2\x80</r>", "\xF0\x9F\x98\x80\xC2\x80"}};
  for (const auto& [xml, expected] : kCases) {
    ParsedText text(xml);
    EXPECT_EQ(text.Root().GetText(), expected) << xml;
  }
}

// The float that a stream in the classic locale reads.
float StreamFloat(const std::string& text) {
  std::istringstream in(text);
  in.imbue(std::locale::classic());
  float value = 0.0F;
  in >> value;
  return value;
}

std::uint32_t Bits(float value) {
  return std::bit_cast<std::uint32_t>(value);
}

std::uint32_t ReadBits(const std::string& text) {
  return Bits(ReadFloat(XMLChBuffer(text).Get()));
}

struct FloatCase {
  const char* text;
  float value;
};

constexpr float kMost = std::numeric_limits<float>::max();

constexpr FloatCase kOddTexts[] = {{"", 0.0F},
                                   {" ", 0.0F},
                                   {"0.1", 0.1F},
                                   {" \t\r\n\v\f2", 2.0F},
                                   {"+5", 5.0F},
                                   {"++5", 0.0F},
                                   {"+-5", 0.0F},
                                   {"- 5", 0.0F},
                                   {"-5", -5.0F},
                                   {".5", 0.5F},
                                   {"5.", 5.0F},
                                   {".", 0.0F},
                                   {"-.5", -0.5F},
                                   {"5..5", 5.0F},
                                   {"1.2.3", 1.2F},
                                   {"1e5", 1e5F},
                                   {"1E+5", 1e5F},
                                   {"1e5x", 1e5F},
                                   {"1e", 0.0F},
                                   {"1e+", 0.0F},
                                   {"1ex", 0.0F},
                                   {"e5", 0.0F},
                                   {"0x10", 0.0F},
                                   {"1 2", 1.0F},
                                   {"1,5", 1.0F},
                                   {"1,234.5", 1.0F},
                                   {"12%", 12.0F},
                                   {"1-2", 1.0F},
                                   {"1+2", 1.0F},
                                   {"nan", 0.0F},
                                   {"inf", 0.0F},
                                   {"-inf", 0.0F},
                                   {"infinity", 0.0F},
                                   {"1e999", kMost},
                                   {"-1e999", -kMost},
                                   {"1e-999", 0.0F},
                                   {"1e-40", 1e-40F},
                                   {"-1e-45", -1e-45F},
                                   {"3.4028235e38", kMost},
                                   {"3.4028236e38", kMost},
                                   {"16777217", 16777216.0F},
                                   {"-0", -0.0F},
                                   {"-0.0e5", -0.0F},
                                   {"1234567890123456789012345678901234567890", kMost},
                                   {"0.1000000000000000000000000000000000000001", 0.1F},
                                   {"00000000000000000000000000000000000000000007", 7.0F},
                                   {"1\xC2\xA0", 1.0F},
                                   {"\xC2\xA0"
                                    "1",
                                    0.0F},
                                   {"\xEF\xBC\x95", 0.0F}};

TEST(ReadFloatTest, OddTextsGiveTheFloatOfAStream) {
  for (const FloatCase& c : kOddTexts) {
    EXPECT_EQ(ReadBits(c.text), Bits(c.value)) << "'" << c.text << "'";
    EXPECT_EQ(Bits(StreamFloat(c.text)), Bits(c.value)) << "stream: '" << c.text << "'";
  }
}

TEST(ReadFloatTest, MadeUpTextsGiveTheFloatOfAStream) {
  std::mt19937 random(20240229);
  const std::string alphabet = "0123456789012345678900..eE+-  x,";
  for (int i = 0; i < 20000; ++i) {
    std::string text;
    for (auto length = random() % 16; length > 0; --length) {
      text += alphabet[random() % alphabet.size()];
    }
    ASSERT_EQ(ReadBits(text), Bits(StreamFloat(text))) << "'" << text << "'";
  }
}

TEST(ReadFloatTest, EveryKindOfFloatGivesTheFloatOfAStreamAtEveryPrecision) {
  std::mt19937 random(42);
  for (int i = 0; i < 20000; ++i) {
    const auto value =
        static_cast<double>(std::bit_cast<float>(static_cast<std::uint32_t>(random())));
    std::array<char, 128> text{};
    const auto digits = static_cast<int>(random() % 45);
    std::snprintf(text.data(), text.size(), i % 2 == 0 ? "%.*g" : "%.*e", digits, value);
    ASSERT_EQ(ReadBits(text.data()), Bits(StreamFloat(text.data()))) << text.data();
  }
}

TEST(ReadUnsignedTest, TextGivesTheNumberAtItsBeginning) {
  constexpr std::pair<const char*, unsigned int> kCases[] = {{"400", 400},
                                                             {" 400", 400},
                                                             {"+400", 400},
                                                             {"400nm", 400},
                                                             {"0000000000400", 400},
                                                             {"400.9", 400},
                                                             {"4294967295", 4294967295U},
                                                             {"999999999", 999999999},
                                                             {"0x10", 0}};
  for (const auto& [text, value] : kCases) {
    EXPECT_EQ(ReadUnsigned(XMLChBuffer(text).Get()), value) << text;
  }
  for (const char* text : {"", " ", "nm", "+", ".5", "4294967296", "99999999999999999999"}) {
    EXPECT_THROW(ReadUnsigned(XMLChBuffer(text).Get()), std::invalid_argument) << text;
  }
}

}  // namespace
}  // namespace Aldermoor::Vexdoc::Internals
