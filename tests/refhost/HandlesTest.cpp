#include "refhost/Handles.h"

#include "tests/refhost/StandIn.h"

namespace refhost {
namespace {

using ::testing::ElementsAre;

struct Thing {
  int worth = 0;
};

void* handOut(HandlePool<Thing>& pool, int worth) {
  void* handle = nullptr;
  Thing* thing = pool.add(&handle);
  EXPECT_EQ(thing->worth, 0) << "what is handed out is blank";
  thing->worth = worth;
  return handle;
}

TEST(Handles, HandleFindsItsObjectUntilItIsGivenBack) {
  const HandleCodec codec(1);
  HandlePool<Thing> pool(codec, HandleKind::Stream);
  void* handle = handOut(pool, 41);
  ASSERT_NE(pool.find(handle), nullptr);
  EXPECT_EQ(pool.find(handle)->worth, 41);
  EXPECT_FALSE(pool.wasGivenBack(handle));
  pool.remove(handle);
  EXPECT_EQ(pool.find(handle), nullptr);
  EXPECT_TRUE(pool.wasGivenBack(handle));
}

TEST(Handles, RecycledSlotDoesNotReviveAStaleHandle) {
  const HandleCodec codec(1);
  HandlePool<Thing> pool(codec, HandleKind::Stream);
  void* first = handOut(pool, 1);
  pool.remove(first);
  void* second = handOut(pool, 2);
  EXPECT_EQ(HandleCodec::heldSlot(first), HandleCodec::heldSlot(second));
  EXPECT_NE(first, second);
  EXPECT_EQ(pool.find(first), nullptr);
  EXPECT_TRUE(pool.wasGivenBack(first));
  EXPECT_EQ(pool.find(second)->worth, 2);
}

TEST(Handles, EachAcquisitionHasANumberOfItsOwn) {
  const HandleCodec codec(3);
  HandlePool<Thing> pool(codec, HandleKind::Batch);
  EXPECT_EQ(codec.describe(handOut(pool, 1)), "batch:1");
  void* second = handOut(pool, 2);
  EXPECT_EQ(codec.describe(second), "batch:2");
  pool.remove(second);
  EXPECT_EQ(codec.describe(handOut(pool, 3)), "batch:3");
  EXPECT_EQ(codec.describe(second), "batch:2");
}

TEST(Handles, HeldObjectsComeInTheOrderInWhichTheyWereHandedOut) {
  const HandleCodec codec(0);
  HandlePool<Thing> pool(codec, HandleKind::Memory);
  void* first = handOut(pool, 10);
  handOut(pool, 20);
  pool.remove(first);
  handOut(pool, 30);  // in the first slot again
  std::vector<int> worths;
  for (const auto& [number, thing] : pool.held()) worths.push_back(thing->worth);
  EXPECT_THAT(worths, ElementsAre(20, 30));
}

TEST(Handles, NoPointerIsFoundInAFreeSlot) {
  const HandleCodec codec(5);
  HandlePool<Thing> pool(codec, HandleKind::Stream);
  const auto findsNothing = [&](const char* when) {
    for (std::uintptr_t bits = 0; bits < 4096; ++bits) {
      EXPECT_EQ(pool.find(reinterpret_cast<void*>(bits)), nullptr) << when << bits;
      EXPECT_EQ(pool.find(reinterpret_cast<void*>(~bits)), nullptr) << when << bits;
    }
  };
  findsNothing("before the first object: ");
  std::vector<void*> handles;
  for (int worth = 1; worth <= 9; ++worth) handles.push_back(handOut(pool, worth));
  findsNothing("among nine objects: ");
  for (std::size_t i = 0; i < handles.size(); i += 2) pool.remove(handles[i]);
  findsNothing("after some were given back: ");
  for (std::size_t i = 0; i < handles.size(); ++i)
    EXPECT_EQ(pool.find(handles[i]) == nullptr, i % 2 == 0) << i;
}

TEST(Handles, AHandleOfAnotherPoolThatLeadsBeyondTheLastSlotIsNotFound) {
  const HandleCodec codec(5);
  HandlePool<Thing> small(codec, HandleKind::Stream);
  HandlePool<Thing> large(codec, HandleKind::Stream);
  handOut(small, 1);
  std::vector<void*> handles;
  for (int worth = 1; worth <= 100; ++worth) handles.push_back(handOut(large, worth));
  EXPECT_NE(small.find(handles[0]), nullptr) << "the same kind, slot and number";
  for (std::size_t i = 1; i < handles.size(); ++i) EXPECT_EQ(small.find(handles[i]), nullptr) << i;
  for (std::size_t i = 0; i < handles.size(); ++i)
    EXPECT_EQ(large.find(handles[i])->worth, static_cast<int>(i) + 1);
}

TEST(Handles, PointerToAnObjectOfTheProcessIsForeign) {
  const HandleCodec codec(0);
  HandlePool<Thing> pool(codec, HandleKind::Stream);
  handOut(pool, 1);
  int local = 0;
  EXPECT_EQ(codec.kindOf(&local), HandleKind::None);
  EXPECT_EQ(pool.find(&local), nullptr);
  EXPECT_FALSE(pool.wasGivenBack(&local));
  EXPECT_EQ(codec.describe(&local), "foreign");
}

TEST(Handles, NumberThatWasNeverHandedOutIsNoStaleHandle) {
  const HandleCodec codec(0);
  HandlePool<Thing> pool(codec, HandleKind::Stream);
  handOut(pool, 1);
  const void* invented = reinterpret_cast<const void*>(codec.held(HandleKind::Stream, 0, 9));
  EXPECT_EQ(pool.find(invented), nullptr);
  EXPECT_FALSE(pool.wasGivenBack(invented));
}

TEST(Handles, EveryKindHasItsNameInTheTrace) {
  const HandleCodec codec(5);
  const std::pair<HandleKind, const char*> kinds[] = {
      {HandleKind::Item, "item:6"},     {HandleKind::Comp, "comp:6"},   {HandleKind::Layer, "layer:6"},
      {HandleKind::Stream, "stream:6"}, {HandleKind::Batch, "batch:6"}, {HandleKind::Memory, "mem:6"},
      {HandleKind::Store, "store:6"}};
  for (const auto& [kind, text] : kinds) {
    const bool givenBack =
        kind == HandleKind::Stream || kind == HandleKind::Batch || kind == HandleKind::Memory;
    const std::uintptr_t bits = givenBack ? codec.held(kind, 11, 6) : codec.lasting(kind, 6);
    EXPECT_EQ(codec.describe(reinterpret_cast<const void*>(bits)), text);
  }
}

TEST(Handles, HandleOfAnEarlierHostIsForeign) {
  VOR_CompItem* old = nullptr;
  {
    StandIn earlier;
    old = earlier.makeComp();
  }
  StandIn now;
  now.makeComp();
  VOR_Item* item = nullptr;
  EXPECT_EQ(kCompSuite9.GetItemFromComp(old, &item), HOST_ERR_BAD_HANDLE);
  EXPECT_THAT(now.leave().refusals,
              ElementsAre("GetItemFromComp: the composition is no handle of this host"));
}

}  // namespace
}  // namespace refhost
