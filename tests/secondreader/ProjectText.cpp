#include "tests/secondreader/ProjectText.h"

#include <ios>
#include <sstream>

namespace secondreader {
namespace {

void write(std::ostringstream& out, const T_Time& time) { out << ' ' << time.value << '/' << time.scale; }

void write(std::ostringstream& out, const HostRatio& ratio) {
  out << ' ' << ratio.numerator << '/' << ratio.denominator;
}

void write(std::ostringstream& out, const refhost::Stream& stream) {
  out << "    stream " << stream.id << " of " << stream.dimension << ':';
  for (const double component : stream.value) out << ' ' << component;
  if (stream.keys != nullptr) {
    out << "; keys";
    for (const T_Time& time : stream.keys->times) write(out, time);
    out << ':';
    for (const double component : stream.keys->values) out << ' ' << component;
  }
  out << '\n';
}

void write(std::ostringstream& out, const refhost::Layer& layer) {
  out << "  layer " << layer.number << " kind " << static_cast<int>(layer.kind) << " \"" << layer.name
      << "\" parent " << (layer.parent == nullptr ? 0 : layer.parent->number) << " source "
      << (layer.source == nullptr ? 0 : layer.source->number) << " flags " << layer.threeDimensional
      << layer.aimed << " children " << layer.childCount << " film " << layer.filmDirection << ' '
      << layer.filmSize << '\n';
  for (const refhost::Stream& stream : layer.streams) write(out, stream);
}

void write(std::ostringstream& out, const refhost::Composition& composition) {
  out << "composition " << composition.number << " item " << composition.itemNumber << " \""
      << composition.name << "\" " << composition.width << 'x' << composition.height;
  write(out, composition.pixelAspect);
  write(out, composition.duration);
  write(out, composition.frameRate);
  out << '\n';
  for (const refhost::Layer* layer : composition.layers) write(out, *layer);
}

}  // namespace

std::string textOf(const refhost::Project& project) {
  std::ostringstream out;
  out << std::hexfloat;
  for (const refhost::Folder& folder : project.folders()) {
    out << "folder " << folder.itemNumber << ':';
    for (const refhost::Composition* composition : folder.compositions) out << ' ' << composition->number;
    out << '\n';
  }
  for (const refhost::Composition& composition : project.compositions()) write(out, composition);
  return out.str();
}

}  // namespace secondreader
