#include "hostutil/HostReport.h"
#include "tests/refhost/StandIn.h"

namespace refhost {
namespace {

using ::testing::ElementsAre;
using ::testing::IsEmpty;
using ::testing::SizeIs;

TEST(Messages, AreShownInTheirOrder) {
  StandIn plugin;
  EXPECT_EQ(kUtilitySuite7.ShowMessage(kPluginId, "one"), 0);
  EXPECT_EQ(kUtilitySuite7.ShowMessage(kPluginId, "two\xFF"), 0);
  EXPECT_THAT(plugin.leave().messages, ElementsAre("one", "two\xEF\xBF\xBD"));
  plugin.enterAgain(Callback::Verify);
  EXPECT_THAT(plugin.leave().messages, IsEmpty());
}

TEST(Messages, AreDroppedWhenSilentErrorsEndWithoutReport) {
  StandIn plugin;
  HostSilentErrorState state{};
  kUtilitySuite7.BeginSilentErrors(&state);
  kUtilitySuite7.ShowMessage(kPluginId, "kept back");
  EXPECT_EQ(kUtilitySuite7.EndSilentErrors(0, &state), 0);
  kUtilitySuite7.ShowMessage(kPluginId, "after");
  EXPECT_THAT(plugin.leave().messages, ElementsAre("after"));
}

TEST(Messages, AreShownWhenSilentErrorsEndWithReport) {
  StandIn plugin;
  HostSilentErrorState state{};
  kUtilitySuite7.BeginSilentErrors(&state);
  kUtilitySuite7.ShowMessage(kPluginId, "kept back");
  EXPECT_EQ(kUtilitySuite7.EndSilentErrors(1, &state), 0);
  EXPECT_THAT(plugin.leave().messages, ElementsAre("kept back"));
}

TEST(Messages, InnerSpanReportsToTheOuterOne) {
  StandIn plugin;
  HostSilentErrorState outer{};
  HostSilentErrorState inner{};
  kUtilitySuite7.BeginSilentErrors(&outer);
  kUtilitySuite7.BeginSilentErrors(&inner);
  kUtilitySuite7.ShowMessage(kPluginId, "deep");
  EXPECT_EQ(kUtilitySuite7.EndSilentErrors(0, &outer), HOST_ERR_SILENT_ERRORS);
  EXPECT_EQ(kUtilitySuite7.EndSilentErrors(1, &inner), 0);
  EXPECT_EQ(kUtilitySuite7.EndSilentErrors(0, &outer), 0);
  EXPECT_THAT(plugin.leave().messages, IsEmpty());
}

TEST(Messages, TranslateAndReportShowsToTheUser) {
  StandIn plugin;
  EXPECT_EQ(HostTranslateAndReport(HOST_EXCEPTION_OTHER, "boom"), HOST_ERR_EXCEPTION_OTHER);
  EXPECT_THAT(plugin.leave().messages, ElementsAre(::testing::HasSubstr("boom")));
}

TEST(Messages, TranslateAndReportIsKeptBackWhileErrorsAreSilent) {
  StandIn plugin;
  HostSilentErrorState state{};
  kUtilitySuite7.BeginSilentErrors(&state);
  HostTranslateAndReport(HOST_EXCEPTION_OTHER, "boom");
  kUtilitySuite7.EndSilentErrors(0, &state);
  EXPECT_THAT(plugin.leave().messages, IsEmpty());
}

TEST(Messages, SpanThatNeverEndsIsReportedAndEndsWithTheCallback) {
  StandIn plugin({}, Callback::Verify);
  HostSilentErrorState state{};
  kUtilitySuite7.BeginSilentErrors(&state);
  EXPECT_THAT(plugin.leave().refusals,
              ElementsAre("VerifyFileCallback: silent errors had begun and were never ended"));
  plugin.enterAgain(Callback::Import);
  kUtilitySuite7.ShowMessage(kPluginId, "heard again");
  const CallbackResult result = plugin.leave();
  EXPECT_THAT(result.messages, ElementsAre("heard again"));
  EXPECT_THAT(result.refusals, IsEmpty());
}

TEST(Messages, SpanWhoseEndWasMadeToFailIsNobodysFault) {
  HostOptions options = withFailure(codeFailure("EndSilentErrors", 1, 5));
  options.during = Callback::Verify;
  StandIn plugin(options, Callback::Verify);
  HostSilentErrorState state{};
  kUtilitySuite7.BeginSilentErrors(&state);
  EXPECT_EQ(kUtilitySuite7.EndSilentErrors(0, &state), 5);
  EXPECT_THAT(plugin.leave().refusals, IsEmpty());
}

}  // namespace
}  // namespace refhost
