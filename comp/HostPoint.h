// Places in the host's space, in points.
#pragma once

struct HostPoint {
  double x, y, z;
};

// What a node scales and turns about.
struct NodePivots {
  HostPoint scale;
  HostPoint rotate;
};
