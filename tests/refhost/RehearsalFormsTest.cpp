#include <gtest/gtest.h>

#include "refhost/Rehearsal.h"

namespace refhost {
namespace {

using Parse = std::optional<Failure> (*)(std::string_view, std::string*);

struct GoodForm {
  Parse parse;
  const char* text;
  const char* operation;
  std::int64_t nth;
  bool onwards;
  Failure::Kind kind;
  HostError code;
};

TEST(RehearsalForms, EveryGoodFormIsRead) {
  constexpr auto code = Failure::Kind::Code;
  constexpr auto badAlloc = Failure::Kind::BadAlloc;
  constexpr auto runtimeError = Failure::Kind::RuntimeError;
  constexpr auto other = Failure::Kind::Other;
  const GoodForm forms[] = {
      {parseFail, "CreateComp:1=512", "CreateComp", 1, false, code, 512},
      {parseFail, "AcquireSuite:0=-3", "AcquireSuite", 0, false, code, -3},
      {parseFail, "FileRead:2=0", "FileRead", 2, false, code, 0},
      {parseFail, "RatioCompare:9223372036854775807=2147483647", "RatioCompare", INT64_MAX, false, code,
       INT32_MAX},
      {parseThrow, "ReleaseStream:3=bad_alloc", "ReleaseStream", 3, false, badAlloc, 0},
      {parseThrow, "ListAppend:4=runtime_error", "ListAppend", 4, false, runtimeError, 0},
      {parseThrow, "FileRead:0=other", "FileRead", 0, false, other, 0},
      {parseFailAt, "5=6", "", 5, false, code, 6},
      {parseFailAt, "7+=-2147483648", "", 7, true, code, INT32_MIN},
      {parseThrowAt, "8=bad_alloc", "", 8, false, badAlloc, 0},
      {parseThrowAt, "9+=runtime_error", "", 9, true, runtimeError, 0},
      {parseThrowAt, "10=other", "", 10, false, other, 0},
      {parseThrowAt, "11+=other", "", 11, true, other, 0},
  };
  for (const GoodForm& form : forms) {
    std::string complaint;
    const auto failure = form.parse(form.text, &complaint);
    ASSERT_TRUE(failure.has_value()) << form.text << ": " << complaint;
    EXPECT_EQ(failure->operation, form.operation) << form.text;
    EXPECT_EQ(failure->nth, form.nth) << form.text;
    EXPECT_EQ(failure->onwards, form.onwards) << form.text;
    EXPECT_EQ(failure->kind, form.kind) << form.text;
    EXPECT_EQ(failure->code, form.code) << form.text;
  }
}

struct BadForm {
  Parse parse;
  const char* text;
  const char* complaint;
};

TEST(RehearsalForms, EveryBadFormIsReportedInWords) {
  const char* namedForm = ": the form is OPERATION:NTH=CODE";
  const char* namedThrowForm = ": the form is OPERATION:NTH=KIND";
  const char* numberedForm = ": the form is K=CODE or K+=CODE";
  const char* numberedThrowForm = ": the form is K=KIND or K+=KIND";
  const BadForm forms[] = {
      {parseFail, "", namedForm},
      {parseFail, "CreateComp", namedForm},
      {parseFail, "CreateComp:1", namedForm},
      {parseFail, "CreateComp=1", namedForm},
      {parseFail, "createcomp:1=2", "\"createcomp\": the host has no such operation"},
      {parseFail, ":1=2", "\"\": the host has no such operation"},
      {parseFail, "CreateComp:x=2", "\"x\": calls are numbered from 1, and 0 is every call"},
      {parseFail, "CreateComp:-1=2", "\"-1\": calls are numbered"},
      {parseFail, "CreateComp:1+=2", "\"1+\": calls are numbered"},
      {parseFail, "CreateComp:9223372036854775808=2", "calls are numbered"},
      {parseFail, "CreateComp:1=", "\"\": a code is a 32-bit integer"},
      {parseFail, "CreateComp:1=2147483648", "a code is a 32-bit integer"},
      {parseFail, "CreateComp:1=bad_alloc", "a code is a 32-bit integer"},
      {parseFail, "CreateComp:1=2 ", "a code is a 32-bit integer"},
      {parseThrow, "CreateComp:1", namedThrowForm},
      {parseThrow, "CreateComp:1=5", "\"5\": an exception is bad_alloc, runtime_error or other"},
      {parseThrow, "CreateComp:1=Bad_Alloc", "an exception is"},
      {parseThrow, "CreateComp:1=code", "an exception is"},
      {parseFailAt, "5", numberedForm},
      {parseFailAt, "0=5", "\"0\": calls are numbered from 1"},
      {parseFailAt, "=5", "calls are numbered from 1"},
      {parseFailAt, "+=5", "calls are numbered from 1"},
      {parseFailAt, "5++=5", "calls are numbered from 1"},
      {parseFailAt, "5=x", "a code is a 32-bit integer"},
      {parseThrowAt, "bad_alloc", numberedThrowForm},
      {parseThrowAt, "1=", "an exception is"},
      {parseThrowAt, "-1=bad_alloc", "calls are numbered from 1"},
  };
  for (const BadForm& form : forms) {
    std::string complaint;
    EXPECT_FALSE(form.parse(form.text, &complaint).has_value()) << form.text;
    EXPECT_NE(complaint.find(form.complaint), std::string::npos) << form.text << ": " << complaint;
  }
}

TEST(RehearsalForms, RefusedSuiteIsNamedWithItsVersion) {
  std::string complaint;
  const auto refused = parseRefuse("QZGP Stream Suite:8", &complaint);
  ASSERT_TRUE(refused.has_value()) << complaint;
  EXPECT_EQ(refused->name, "QZGP Stream Suite");
  EXPECT_EQ(refused->version, 8);
}

TEST(RehearsalForms, SuiteThatIsNotOfferedCannotBeRefused) {
  for (const char* text : {"QZGP Stream Suite", "QZGP Stream Suite:", "QZGP Stream Suite:x", ":8",
                           "QZGP Stream Suite:9", "qzgp stream suite:8", "QZGP Stream Suite:-8"}) {
    std::string complaint;
    EXPECT_FALSE(parseRefuse(text, &complaint).has_value()) << text;
    EXPECT_NE(complaint.find(text), std::string::npos) << complaint;
  }
}

}  // namespace
}  // namespace refhost
