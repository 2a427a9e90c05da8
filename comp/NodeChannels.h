// The animated channels of one node, fetched once, so that its keys can be read without its curves' records.
#pragma once

#include <array>
#include <cstdint>

#include "maya/SceneRecords.h"

struct NodeChannels {
  struct Channel {
    const RecordList* keys = nullptr;  // null when the channel has no curve, or its curve no keys
    std::int64_t count = 0;
    const MAYA_Key* run = nullptr;  // all keys in one place; null where they are fetched one by one
  };

  std::array<Channel, kChannelCount> channels;  // by curve slot
  std::int32_t sharedCount = 0;                 // of the channels that have two keys or more; 0 when none has

  // The slots of the channels that have keys, in the order in which a sample reads them: scale, rotate,
  // translate.
  std::array<std::uint8_t, kChannelCount> sampled{};
  std::size_t sampledCount = 0;

  // Fills in `sampled`, from `channels`.
  void ListSampled();

  // Finds the keys' places, for one who is going to read every key time and every sample.
  void FetchRuns();

  // Overwrites the animated channels of `values`, by curve slot, with key n, as Extract does.
  void Sample(std::int32_t n, double (&values)[kChannelCount]) const;

  // Overwrites the animated axes of `values` with key n of the group; a channel of one key gives that one.
  // Throws the list's code when a channel has no key n.
  void Extract(std::int32_t group, std::int32_t n, double (&values)[kAxisCount]) const;
};
