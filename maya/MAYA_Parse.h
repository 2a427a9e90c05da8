// Reads a baked Maya ASCII scene into records (maya/) and rebuilds it as a composition (comp/).
//
// One object per import. Its members are grouped by the source file that holds them, in the order in which
// they call down the page. Every failure is a bare integer exception that carries a host error code; a
// standard exception that comes in through a host call passes through unless a member says that it translates
// it.
#pragma once

#include <cstdint>
#include <string_view>
#include <vector>

#include "hostapi/HostTypes.h"
#include "hostutil/HostUtilities.h"
#include "maya/ConnectionScout.h"
#include "maya/MAYA_Lex.h"
#include "maya/NameIndex.h"
#include "maya/NodeChannels.h"
#include "maya/SceneRecords.h"
#include "maya/SceneUnits.h"

namespace mayaimport {

class MAYA_Parse : public MAYA_Lex {
 public:
  // ---- maya/MAYA_Parse.cpp: lifetime and the main loop ----

  // The text as for MAYA_Lex. The settings have their defaults, the lists are null.
  MAYA_Parse(const WNBasicSuite* basicSuite, const char* buffer, const char* end = nullptr);

  // Disposes of the lists, each curve's keys and keys that no curve holds yet.
  ~MAYA_Parse();

  // Reads the whole text. Records made before a failure stay.
  void Parse();

  // Calls the "setAttr" parser of the current node's kind; a kind without attributes reads nothing.
  void ParseSetAttr();

  // Commands that change nothing.
  void ParseParent();
  void ParseTransformParent();
  void ParseCameraParent();
  void ParseLocatorSetAttr();

  // Copies a token of at most 254 bytes, NUL-terminated; a longer one gives the empty text and length 0. What
  // stands in the field after the NUL stays.
  static void BuildString(const char* first, const char* last, std::int32_t* length,
                          char (&text)[kNameCapacity]);

  // The same without the token's first and last byte, its quotes; the length still counts them. A token
  // without both gives the empty text too.
  static void BuildQuote(const char* first, const char* last, std::int32_t* length,
                         char (&text)[kNameCapacity]);

  // ---- maya/MAYA_Parse_Nodes.cpp: "createNode" ----

  void ParseCreateNode();
  void ParseCreateTransformNode();
  void ParseCreateLookAtNode();
  void ParseCreateCameraNode();
  void ParseCreateAnimNode();
  void ParseCreateLocatorNode();

  // ---- maya/MAYA_Parse_Attributes.cpp: "setAttr" on transforms and cameras ----

  void ParseTransformSetAttr();
  void ParseCameraSetAttr();

  // ---- maya/MAYA_Parse_Keys.cpp: "setAttr" on animation curves ----

  void ParseAnimSetAttr();

  // ---- maya/MAYA_Parse_Render.cpp: "select", and "setAttr" on the render settings ----

  void ParseSelect();
  void ParseRenderSetAttr();

  // ---- maya/MAYA_Parse_Units.cpp: "currentUnit" ----

  void ParseCurrentUnit();

  // ---- maya/MAYA_Parse_Connections.cpp: "connectAttr" ----

  void ParseConnectAttr();

  // Records what a connection between two plugs means. Each plug is cut at its first ".", whose position is
  // given, into a node and an attribute.
  void MakeConnection(std::string_view source, std::size_t sourceDot, std::string_view destination,
                      std::size_t destinationDot);

  // ---- comp/MAYA_Parse_Assembly.cpp: the compositions ----

  // Builds the composition in the folder, under the name (NUL-terminated). A scene without a camera list
  // makes nothing. What was made before a failure stays.
  void MakeComp(VOR_Item* folder, const UTF16String* name);

  // ---- comp/MAYA_Parse_Layers.cpp: cameras, locators, and the nulls above them ----

  void CreateCameraLayerAndKeyframes(VOR_CompItem* comp, const MAYA_Camera* camera);
  void CreateLocatorLayerAndKeyframes(VOR_CompItem* comp, const MAYA_Locator* locator);

  // Makes the locator's null layer with its transform applied, and hands it out.
  void CreateLocator(const MAYA_Locator* locator, VOR_CompItem* comp, VOR_Layer** layer);

  // ---- comp/MAYA_Parse_CameraAnimation.cpp: zoom keys, then the camera's transform ----

  void ApplyCameraAnimation(VOR_Layer* layer, const MAYA_Camera* camera);

  // ---- comp/MAYA_Parse_TransformAnimation.cpp: keys of position, rotation and scale ----

  void ApplyTransformAnimation(VOR_Layer* layer, const MAYA_Transform* node);

  // ---- comp/MAYA_Parse_LookAt.cpp: aiming a camera ----

  // Aims the camera at the constraint's target. False, and nothing done, when the constraint turns another
  // transform than the camera's.
  bool SetCameraLookAt(VOR_Layer* layer, const MAYA_Camera* camera, const MAYA_Transform* constraint);

  // Keys of the layer's anchor point, a camera's point of interest, from the node's translate alone.
  void ApplyAnchorPointAnimation(VOR_Layer* layer, const MAYA_Transform* node);

  // Switches aiming on and sets the anchor point to the node's translate.
  void SetAnchorPoint(VOR_Layer* layer, const MAYA_Transform* node);

  // ---- comp/MAYA_Parse_Camera.cpp: the lens ----

  void SetCamera(VOR_Layer* layer, const MAYA_Camera* camera);

  // The film size in points.
  double CalculatePixelFit(const MAYA_Camera* camera) const;

  // The zoom in pixels for a film size in points and a focal length in millimetres; null takes the camera's.
  double CalculateZoom(const MAYA_Camera* camera, double filmSize, const double* focalLength) const;

  // ---- comp/MAYA_Parse_Transform.cpp: a transform in the host's space ----

  // Sets anchor point, scale, rotations and position of the layer.
  void SetTransform(VOR_Layer* layer, const MAYA_Transform* node);

  // ---- comp/MAYA_Parse_Sampling.cpp: the keys of a node, by index ----

  // VerifyAnimInfo comes first, then for each key from 0 on its time, and then its values. All throw the code
  // of a list that fails.

  // The key count that the node's channels share, 0 when none is animated. Throws 1289987 after its message
  // when two animated channels differ. What it finds is remembered for the two others.
  std::int32_t VerifyAnimInfo(const MAYA_Transform* node);

  // The time of key n. With n 0 in a frame-based scene the key becomes time 0. With n 0 the keys of a node
  // that is remembered are looked up, all at once.
  T_Time GetKeyTime(const MAYA_Transform* node, std::int32_t n);

  // Overwrites the animated axes of `values` with key n of the group's curves; a curve of one key gives that.
  // The group is a ChannelGroup. After a failure the axes before it stay written.
  void ExtractAnimInfo(const MAYA_Transform* node, std::int32_t group, std::int32_t n,
                       double (&values)[kAxisCount]) {
    if (!channels_.Extract(*node, group, n, values)) FetchAnimInfo(*node, group, n, values);
  }

  // ---- comp/MAYA_Parse_Streams.cpp: values and keyframe batches ----

  // Each acquires the stream, uses it and releases it, also after a failure. A standard exception in between
  // is translated.
  void SetOneDStream(VOR_Layer* layer, std::int32_t streamId, double value);
  void SetTwoDStream(VOR_Layer* layer, std::int32_t streamId, double x, double y);
  void SetThreeDStream(VOR_Layer* layer, std::int32_t streamId, double x, double y, double z);
  void StartAddingKeyframes(VOR_Layer* layer, std::int32_t streamId, VOR_AddKeyframesInfo** batch);
  void InsertOneDKeyframe(VOR_AddKeyframesInfo* batch, VOR_Layer* layer, std::int32_t streamId,
                          const T_Time* time, double value) {
    InsertKeyframe(batch, layer, streamId, time, value, 0.0, 0.0);
  }
  void InsertThreeDKeyframe(VOR_AddKeyframesInfo* batch, VOR_Layer* layer, std::int32_t streamId,
                            const T_Time* time, double x, double y, double z) {
    InsertKeyframe(batch, layer, streamId, time, x, y, z);
  }

  // Commits the batch. A code of the host's is ignored.
  void EndAddingKeyframes(VOR_AddKeyframesInfo* batch);

  // ---- comp/MAYA_Parse_Timing.cpp: times, rates, aspects ----

  // Sets the process-wide time offset to 0.
  static void ResetOffset();

  // A scene time as a host time. With `first` in a frame-based scene it becomes time 0.
  T_Time ConvertTime(double time, std::uint8_t first) const;

  // The composition's duration: the latest last key of any curve, or ten seconds.
  T_Time FindLongestAnimation() const;

  HostRatio FindFrameRate() const;
  HostRatio FindPixelAspectRatio() const;

  // The horizontal scale factor: the pixel aspect.
  double CalculateHSF() const;

  // ---- comp/MAYA_Parse_SceneUnits.cpp: distances and angles ----

  double ConvertDist(double distance) const;
  double ConvertRot(double angle) const;

  // ---- The scene ----

  // The node that the last "createNode" or "select" made current, as a copy of its record.
  std::int32_t currentKind = kNoNode;
  union CurrentNode {
    MAYA_Transform transform;
    MAYA_Camera camera;
    MAYA_AnimCurve curve;
    MAYA_Locator locator;
  } current;

  std::int32_t timeUnit = kSecond;
  double frameRate = 29.97;  // frames per second, with kCustomRate
  std::int32_t angleUnit = kDegree;
  std::int32_t linearUnit = kCentimeter;

  std::int32_t resolutionWidth = 720;  // pixels
  std::int32_t resolutionHeight = 486;
  double deviceAspectRatio = 1.3333333333333333;
  double pixelAspect = 0.9091;  // width to height

  // In order of creation within each kind; null until the first record.
  RecordList* transforms = nullptr;
  RecordList* cameras = nullptr;
  RecordList* curves = nullptr;
  RecordList* locators = nullptr;

 private:
  using ChannelValues = double[kGroupCount][kAxisCount];

  // maya/MAYA_Parse.cpp
  MayaToken NextInCommand(const char** first, const char** last);
  double ScanNumber(const char* first, const char* last) const;
  std::int64_t ReadPlainNumbers(double* numbers, std::int64_t capacity);
  void ThrowOnNumberError(HostError code, const char* number) const;
  void ClearCurrent();
  void DisposeLooseKeys();

  // maya/MAYA_Parse_Nodes.cpp
  template <typename Record>
  void CreateNodeRecord(Record record, NodeKind kind, RecordList** list, NameIndex* names);
  bool TakeName(char (&name)[kNameCapacity]);

  // maya/MAYA_Parse_Attributes.cpp
  template <typename Record>
  void WriteBack(RecordList* list, const Record& record);
  bool ReadOrthographic();
  std::int64_t ReadNumbers(double* values, std::int64_t capacity);
  template <std::size_t Count>
  bool ReadComponents(double (&field)[Count]);
  bool ReadLastNumber(double* value);

  // maya/MAYA_Parse_Keys.cpp
  bool FindKeyAttribute(std::string_view* lastNumber);
  void ReadKeys(std::string_view keyCount);
  bool ReadPlainKeys(std::string_view keyCount, double* time);
  void AppendKeys(const void* keys, std::int64_t count, std::int64_t room);
  void WriteBackCurve();

  // maya/MAYA_Parse_Connections.cpp
  void ConnectCurve(std::int32_t curve, std::int32_t transform, std::string_view attribute);
  void ConnectTransforms(std::int32_t source, std::string_view sourceAttribute, std::int32_t destination,
                         std::string_view attribute);
  void SetLink(std::int32_t transform, int slot, std::int32_t index);

  // comp/MAYA_Parse_Assembly.cpp
  VOR_CompItem* CreateCompositions(VOR_Item* folder, const UTF16String* name);

  // comp/MAYA_Parse_Layers.cpp
  void CreateParentNulls(VOR_CompItem* comp, VOR_Layer* child, std::int32_t transform);
  VOR_Layer* NewNull(VOR_CompItem* comp, const char* name);
  void LookAtPass(VOR_Layer* layer, const MAYA_Camera* camera, std::int32_t transform);
  void CollectConstraints();

  // comp/MAYA_Parse_CameraAnimation.cpp
  void ApplyZoomAnimation(VOR_Layer* layer, const MAYA_Camera* camera);
  void InsertZoomKeys(VOR_AddKeyframesInfo* batch, VOR_Stream* stream, const MAYA_Camera* camera,
                      const RecordList* keys);

  // comp/MAYA_Parse_TransformAnimation.cpp
  void InsertTransformKeys(VOR_Layer* layer, const MAYA_Transform& node, std::int32_t keyCount,
                           VOR_AddKeyframesInfo* const* batches);

  // comp/MAYA_Parse_Camera.cpp
  void SetUnguarded(VOR_Layer* layer, std::int32_t streamId, double x);

  // comp/MAYA_Parse_Transform.cpp
  void ConvertPoint(const double* point, double (&host)[kAxisCount]) const;
  PivotedTransform ConvertPivots(const MAYA_Transform& node) const;
  static void CopyChannels(const MAYA_Transform& node, ChannelValues& values);
  MatrixComponents DecomposeTransform(PivotedTransform* transform, const ChannelValues& values) const;

  // comp/MAYA_Parse_Sampling.cpp
  [[gnu::noinline]] T_Time FetchKeyTime(const MAYA_Transform& node, std::int32_t n);
  void FetchAnimInfo(const MAYA_Transform& node, std::int32_t group, std::int32_t n,
                     double (&values)[kAxisCount]);

  // comp/MAYA_Parse_Streams.cpp
  VOR_Stream* AcquireStream(VOR_Layer* layer, std::int32_t streamId);
  template <typename Work>
  void UseStream(VOR_Layer* layer, std::int32_t streamId, Work&& work);
  void SetStream(VOR_Layer* layer, std::int32_t streamId, double x, double y, double z);
  void InsertKeyframe(VOR_AddKeyframesInfo* batch, VOR_Layer* layer, std::int32_t streamId,
                      const T_Time* time, double x, double y, double z);

  std::int32_t currentRecord_ = kNoIndex;  // the record that `current` is written back to
  NameIndex transformNames_;
  NameIndex cameraNames_;
  NameIndex curveNames_;
  ConnectionScout scout_;

  // Used while the composition is built; by transform index.
  std::vector<std::uint32_t> chainOfTransform_;  // the last parent chain that used it
  std::uint32_t chain_ = 0;
  std::vector<std::int32_t> constraintOfTransform_;  // the first complete constraint that turns it
  NodeChannels channels_;                            // of the node that VerifyAnimInfo found in order last
};

}  // namespace mayaimport
