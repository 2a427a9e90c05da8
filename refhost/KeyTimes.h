// The times of a stream's keys. Streams whose keys lie at the same times share one array of them.
#pragma once

#include <cstddef>
#include <cstring>
#include <initializer_list>
#include <memory>
#include <utility>
#include <vector>

#include "hostapi/HostTypes.h"

namespace refhost {

class KeyTimes {
 public:
  using value_type = T_Time;
  using const_iterator = std::vector<T_Time>::const_iterator;

  KeyTimes() : KeyTimes(std::vector<T_Time>{}) {}
  explicit KeyTimes(std::vector<T_Time> times)
      : times_(std::make_shared<const std::vector<T_Time>>(std::move(times))) {}
  KeyTimes(std::initializer_list<T_Time> times) : KeyTimes(std::vector<T_Time>(times)) {}

  operator const std::vector<T_Time>&() const { return *times_; }
  const_iterator begin() const { return times_->begin(); }
  const_iterator end() const { return times_->end(); }
  std::size_t size() const { return times_->size(); }
  bool empty() const { return times_->empty(); }
  const T_Time& operator[](std::size_t key) const { return (*times_)[key]; }
  const T_Time& front() const { return times_->front(); }
  const T_Time& back() const { return times_->back(); }

  // Whether these are the `count` times of the array.
  bool equal(const T_Time* times, std::size_t count) const {
    static_assert(sizeof(T_Time) == sizeof(T_Time::value) + sizeof(T_Time::scale), "no padding");
    return count == size() && (count == 0 || std::memcmp(times_->data(), times, count * sizeof(T_Time)) == 0);
  }

 private:
  std::shared_ptr<const std::vector<T_Time>> times_;  // never null
};

}  // namespace refhost
