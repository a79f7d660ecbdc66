// What the containers leave behind when memory is short, and how much work they do.

#include <functional>
#include <limits>
#include <sstream>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "aldermoor/vexdoc/recipe.h"
#include "aldermoor/vexdoc/vex.h"

#include "tests/faults/interposition.h"
#include "tests/vexdoc/internals/documenttext.h"
#include "tests/vexdoc/support.h"

namespace Aldermoor::Vexdoc::Testing {
namespace {

using namespace Aldermoor::Vexdoc::Tests;

// The document, and the attributes of its sample "a", their flags and all "Modified".
std::string TextOf(const VEX& document) {
  std::ostringstream out;
  out << DocumentText(document) << document.GetModificationDateTime();
  for (const auto& [key, set] : document.GetElements()) {
    out << '\n' << key << '=' << set->GetName() << ' ' << set->GetModificationDateTime();
    for (const auto& [name, sample] : set->GetElements()) {
      out << '\n' << name << '=' << sample->GetName() << ' ' << sample->GetModificationDateTime();
      EXPECT_TRUE(IsSame(set->GetElement(name), sample)) << name;
      for (const auto& [attribute, value] : sample->GetElements()) {
        out << ' ' << attribute << '=' << value->GetName() << value->IsDerived();
      }
    }
  }
  return out.str();
}

struct Scene {
  Scene() {
    SmartPointer<Sample> sample(new Sample("a sample of a long name"));
    sample->AddSampleAttribute(Shared(Flat(0.5F), "spectrum"));
    sample->AddSampleAttribute(Shared(Lab(1, 2, 3), "colour"));
    set->AddElement(sample);
    set->AddElement(SmartPointer<Sample>(new Sample("b")));
    document.AddElement(set);
    for (Header* element : std::vector<Header*>{&document, set.Get(), sample.Get()}) {
      element->SetAttribute(Header::kModifiedKey, "long ago");
    }
    first = sample;
  }

  VEX document;
  SmartPointer<SampleSet> set{new SampleSet("set")};
  SmartPointer<Sample> first;
  const SmartPointer<Sample> taken{new Sample("a sample of a long name")};
  const Conditions other_light = ColorConditions("CIEXYZ", "D65");
};

using Operation = std::function<void(Scene&)>;

const std::pair<const char*, Operation> kOperations[] = {
    {"add an element",
     [](Scene& s) {
       s.set->AddElement(s.taken);
     }},
    {"add a copy",
     [](Scene& s) {
       s.set->AddSample(*s.taken);
     }},
    {"add to a new set",
     [](Scene& s) {
       s.document.AddSample("a new set of samples", *s.taken);
     }},
    {"insert by index",
     [](Scene& s) {
       s.document.InsertSample("set", *s.taken, 1);
     }},
    {"insert into a new set",
     [](Scene& s) {
       s.document.InsertSample("new", *s.taken, 0);
     }},
    {"add a set",
     [](Scene& s) {
       s.document.AddSampleSet(*s.set);
     }},
    {"add a set by name",
     [](Scene& s) {
       s.document.AddSampleSet("another set of samples");
     }},
    {"insert a set",
     [](Scene& s) {
       s.document.InsertSampleSet("set", 0);
     }},
    {"find or create",
     [](Scene& s) {
       s.document.FindElement("yet another set", true);
     }},
    {"remove",
     [](Scene& s) {
       s.set->RemoveSample("b");
     }},
    {"remove an object",
     [](Scene& s) {
       s.set->RemoveElement(s.first);
     }},
    {"rename",
     [](Scene& s) {
       s.set->RenameSample("b", "quite another long name");
     }},
    {"rename to a taken name",
     [](Scene& s) {
       s.set->RenameSample("b", s.taken->GetName());
     }},
    {"rename an attribute",
     [](Scene& s) {
       s.first->RenameElement("colour", "a longer name");
     }},
    {"swap",
     [](Scene& s) {
       s.set->SwapSample("b", s.taken->GetName());
     }},
    {"add an attribute",
     [](Scene& s) {
       s.first->AddSampleAttribute(Shared(Flat(1), "x"));
     }},
    {"store a result",
     [](Scene& s) {
       s.first->GetSampleAttribute("VEXColorVector", s.other_light, true);
     }},
    {"remove at a walk",
     [](Scene& s) {
       auto position = s.first->GetFirstSampleAttribute();
       s.first->Remove(position);
     }},
    {"insert at a walk",
     [](Scene& s) {
       auto position = s.document.GetFirstSample("set");
       s.document.InsertSample(*s.taken, position);
     }},
    {"delete at a walk",
     [](Scene& s) {
       auto position = s.document.GetFirstSample("set");
       position.DeprecatedDelete();
     }},
    {"assign a document",
     [](Scene& s) {
       s.document = VEX("another document");
     }},
    {"assign a sample",
     [](Scene& s) {
       *s.first = *s.set->GetSample("b");
     }},
    {"assign a spectrum",
     [](Scene& s) {
       Spectrum other = Flat(0.25F, 40);
       other.SetName("a spectrum of a long name");
       s.first->GetElement("spectrum")->Assign(other);
     }},
    {"set a text",
     [](Scene& s) {
       s.set->SetDescription("a description of some length");
     }},
};

TEST(ContainerFaultsTest, WhatFailsChangesNothing) {
  for (const auto& [name, operation] : kOperations) {
    SCOPED_TRACE(name);
    for (const Fault::Kind kind : {Fault::kAllocation, Fault::kAllocations}) {
      long failures = 0;
      Outcome outcome;
      for (long number = 1; number == 1 || outcome.was_reached; ++number) {
        Scene scene;
        const std::string before = TextOf(scene.document);
        outcome = RunWith({kind, number}, [&, &operation = operation] { operation(scene); });
        failures += outcome.has_failed ? 1 : 0;
        const std::string after = TextOf(scene.document);
        EXPECT_EQ(outcome.has_failed, after == before) << "allocation " << number;
        EXPECT_TRUE(!outcome.has_failed || scene.taken->GetName() == "a sample of a long name");
      }
      EXPECT_GT(failures, 0);
    }
  }
}

TEST(ContainerFaultsTest, ConditionsAndRecipesAreAssignedWholeOrNotAtAll) {
  const Conditions before = ColorConditions("CIELab");
  Conditions after = ColorConditions("a colour space of a long name", "an illumination, long too");
  after.AddAttribute("another key, for another node", "another value, for another text");
  const Recipe old(before, "old", 1, "old", {});
  const Recipe changed(after, "an assortment of a long name", 2, "a substrate of a long name",
                       {{"a component of a long name", 1.0F}});
  Outcome outcome;
  for (long number = 1; number == 1 || outcome.was_reached; ++number) {
    Conditions conditions = before;
    outcome = RunWith({Fault::kAllocation, number}, [&] { conditions = after; });
    EXPECT_TRUE(conditions == (outcome.has_failed ? before : after)) << number;
  }
  for (long number = 1; number == 1 || outcome.was_reached; ++number) {
    Recipe recipe = old;
    outcome = RunWith({Fault::kAllocation, number}, [&] { recipe = changed; });
    EXPECT_TRUE(recipe == (outcome.has_failed ? old : changed)) << number;
  }
}

// Allocations for `count` samples of one name: each name that is tried takes one.
long WorkFor(std::size_t count, const std::function<void(SampleSet&, const Sample&)>& add) {
  const Sample sample("a name that does not fit into the string itself");
  SampleSet set;
  return RunWith({Fault::kAllocation, std::numeric_limits<long>::max()},
                 [&] {
                   for (std::size_t i = 0; i < count; ++i) {
                     add(set, sample);
                   }
                 })
      .calls;
}

TEST(ContainerFaultsTest, EqualNamesTakeWorkInProportion) {
  const std::function<void(SampleSet&, const Sample&)> ways[] = {
      [](SampleSet& set, const Sample& sample) { set.AddSample(sample); },
      [](SampleSet& set, const Sample& sample) {
        Sample other(sample);
        other.SetName("x");
        set.AddSample(other);
        set.RenameSample("x", sample.GetName());
      },
      [](SampleSet& set, const Sample& sample) {
        set.AddSample(sample);
        set.RenameSample(set.GetElements().back().first, sample.GetName());
      },
  };
  for (const auto& way : ways) {
    const long work = WorkFor(500, way);
    EXPECT_GT(work, 500);
    EXPECT_LT(WorkFor(1000, way), work * 21 / 10);
  }
}

}  // namespace
}  // namespace Aldermoor::Vexdoc::Testing
