"""Sixty faults with names: wrong changes of the product that somebody might make, each of which a test has to catch.

Unlike the mutants, which a rule makes, these were chosen: each breaks a sentence that the importer, the host or the
tool is meant to keep. A fault replaces a text that stands once in its file. Where the product is changed so that the
text is gone, the fault moves to where its sentence is now kept; it is dropped only together with the sentence.
"""

from dataclasses import dataclass


@dataclass(frozen=True)
class Fault:
    name: str
    file: str
    old: str
    new: str

    def applied(self, source):
        return source.replace(self.old, self.new, 1)


FAULTS = (
    # --- hostutil/ ---
    Fault("every rotation about a coordinate axis turns the other way", "hostutil/HostMatrixInternal.h",
          "const double s = std::sin(angle);", "const double s = std::sin(-angle);"),
    Fault("a rotation about an oblique axis turns the other way", "hostutil/HostMatrix.cpp",
          "const double s = std::sin(angle);", "const double s = std::sin(-angle);"),
    Fault("a mirrored matrix gets a negative scale in y, not in x", "hostutil/HostMatrixDecompose.cpp",
          "components->scale[0] = -components->scale[0];", "components->scale[1] = -components->scale[1];"),
    Fault("at the pole Z keeps an angle of its own", "hostutil/HostMatrixDecompose.cpp",
          "if (cosineY >= kPoleCosine) {", "if (cosineY >= 0.0) {"),
    Fault("a matrix that is not finite is no failure", "hostutil/HostMatrixDecompose.cpp",
          "return HOST_ERR_MATRIX_NOT_FINITE;", "return HOST_ERR_NONE;"),
    Fault("the scale pivot is not moved back", "hostutil/HostMatrixPivoted.cpp",
          "Translate(&matrix, At(from->scalePivot));", ""),
    Fault("a number too small for a double fails", "scan/Decimal.cpp",
          "if (leading < -kHugeExponent) return NumberStatus::Ok;",
          "if (leading < -kHugeExponent) return NumberStatus::Range;"),
    Fault("the exponent's sign is ignored", "scan/Decimal.cpp",
          "decimal->exponent = sign == '-' ? -exponent : exponent;", "decimal->exponent = exponent;"),
    Fault("letters after a number make it fail", "scan/Decimal.cpp",
          "while (at != cursor.end && IsLetter(*at)) ++at;",
          "if (at != cursor.end && IsLetter(*at)) return false;"),
    Fault("ratios are compared in 32 bits", "hostutil/HostNumbers.cpp",
          "const std::int64_t left = std::int64_t{a->numerator} * std::int64_t{b->denominator};",
          "const std::int64_t left = "
          "static_cast<std::int32_t>(static_cast<std::uint32_t>(a->numerator) * b->denominator);"),
    Fault("the growth step is ignored", "hostutil/RecordList.cpp",
          "const std::int64_t least = std::max(list->growth, wanted);", "const std::int64_t least = wanted;"),
    Fault("a list with a locked record takes appends", "hostutil/RecordList.cpp",
          "if (list->locks != 0) return HOST_ERR_LIST_LOCKED;", ""),
    Fault("a directory counts as a file", "hostutil/HostFile.cpp",
          "return result == 0 && S_ISREG(status->st_mode);", "return result == 0;"),
    Fault("a short read passes for a whole one", "hostutil/HostFile.cpp",
          "if (got <= 0) return false;", "if (got <= 0) return got == 0;"),
    Fault("the extension begins at the first dot", "hostutil/UTF16String.cpp",
          "for (std::int64_t i = length; i > 0; --i) {", "for (std::int64_t i = 1; i <= length; ++i) {"),
    Fault("a surrogate in UTF-8 passes", "hostutil/Paths.cpp",
          "codePoint > kLastCodePoint || IsSurrogate(codePoint)) break;", "codePoint > kLastCodePoint) break;"),
    Fault("exhausted memory is reported as any other exception", "hostutil/HostReport.cpp",
          "const HostError code = memory ? HOST_ERR_EXCEPTION_MEMORY : HOST_ERR_EXCEPTION_OTHER;",
          "const HostError code = HOST_ERR_EXCEPTION_OTHER;"),

    # --- plugin/ ---
    Fault("the NUL after the text is missing", "plugin/ImportDriver.cpp",
          "std::memset(text_ + size_, 0, kTerminatorBytes);", "std::memset(text_ + size_ + 1, 0, kTerminatorBytes - 1);"),
    Fault("the second NUL is missing", "plugin/ImportDriver.cpp",
          "std::memset(text_ + size_, 0, kTerminatorBytes);", "std::memset(text_ + size_, 0, kTerminatorBytes - 1);"),
    Fault("the extension is removed with flag 0", "plugin/ImportDriver.cpp",
          "constexpr std::int32_t kRemove = 1;", "constexpr std::int32_t kRemove = 0;"),
    Fault("the extension is removed with flag 2", "plugin/ImportDriver.cpp",
          "constexpr std::int32_t kRemove = 1;", "constexpr std::int32_t kRemove = 2;"),
    Fault("the header is compared with its case", "plugin/ImportDriver.cpp",
          "SameWord(std::string_view(header, kHeader.size()), kHeader) ? 1 : 0;",
          "std::string_view(header, kHeader.size()) == kHeader ? 1 : 0;"),
    Fault("suites are released in the opposite order", "plugin/QZGP_SuiteHandler.cpp",
          "for (std::size_t slot = 0; slot < kSlotCount; ++slot) {", "for (std::size_t slot = kSlotCount; slot-- > 0;) {"),
    Fault("the misspelt message is mended", "plugin/Messages.cpp", "=Inconsistant number", "=Inconsistent number"),
    Fault("the file type is packed from its end", "plugin/Entry.cpp",
          "FourCharacters(\"MAYA\")", "FourCharacters(\"AYAM\")"),

    # --- maya/ ---
    Fault("an escaped quote ends the string", "maya/MAYA_Lex.cpp",
          "} while (*at == '\"' && at[-1] == '\\\\');", "} while (false);"),
    Fault("a slash and three stars close a comment", "maya/MAYA_Lex.cpp",
          "if (*position != '*') continue;\n    ++position;",
          "if (*position != '*') continue;\n    if (position[1] == '/') ++position;"),
    Fault("a token of 254 bytes is too long", "maya/TokenText.h",
          "return length <= kLongestToken ? length : 0;", "return length < kLongestToken ? length : 0;"),
    Fault("the lists are disposed of in another order", "maya/MAYA_Parse.cpp",
          "RecordListDispose(cameras);\n  RecordListDispose(transforms);",
          "RecordListDispose(transforms);\n  RecordListDispose(cameras);"),
    Fault("a camera of film fit 2 counts as horizontal", "maya/MAYA_Parse_Attributes.cpp",
          "return NearlyEqual(value, kVerticalFit) ? 1 : 0;", "return NearlyEqual(value, kVerticalFit) ? 0 : 0;"),
    Fault("a scale that is not given is 0", "maya/MAYA_Parse_Attributes.cpp",
          "{\".s\", \".scale\", &MAYA_Transform::scale, 1.0},", "{\".s\", \".scale\", &MAYA_Transform::scale, 0.0},"),
    Fault("keys that a write-back replaces are never freed", "maya/MAYA_Parse_Keys.cpp",
          "if (target.keys != current.curve.keys) RecordListDispose(target.keys);", ""),
    Fault("a key without a value is dropped", "maya/MAYA_Parse_Keys.cpp",
          "AppendKeys(&key, 1, 1);", "if (next == Number) AppendKeys(&key, 1, 1);"),
    Fault("lists are made with a growth step of 11", "maya/ListAccess.h",
          "constexpr std::int64_t kGrowthStep = 10;", "constexpr std::int64_t kGrowthStep = 11;"),
    Fault("a connection to a camera's focalLength is ignored", "maya/MAYA_Parse_Connections.cpp",
          "kFocalLengthInputs[] = {\"fl\", \"focalLength\"};", "kFocalLengthInputs[] = {\"fl\"};"),
    Fault("a name is looked up as its last record", "maya/NameIndex.cpp",
          "++used_;\n  }\n  return entry.index;", "++used_;\n  }\n  entry.index = index;\n  return entry.index;"),
    Fault("the unit palf is taken for pal", "maya/MAYA_Parse_Units.cpp",
          "{\"palf\", kPalField}", "{\"palf\", kPal}"),
    Fault("a word that two blocks share begins twice", "scan/SkipTextBlocks.h",
          "return block == position || IsWordEnd(block[-1]);", "return true;"),

    # --- comp/ ---
    Fault("a rotation about Y keeps its sign", "comp/MAYA_Parse_Transform.cpp",
          "ConvertRot(rotate[1]) * -kDegreesToRadians;", "ConvertRot(rotate[1]) * kDegreesToRadians;"),
    Fault("z of an aimed camera's keys keeps its sign", "comp/MAYA_Parse_LookAt.cpp",
          "-ConvertDist(point[1]), -ConvertDist(point[2]));", "-ConvertDist(point[1]), ConvertDist(point[2]));"),
    Fault("a channel of one key is dropped from the sampling", "maya/NodeChannels.cpp",
          "if (channel.count == 0) continue;", "if (channel.count < kAnimatedKeyCount) continue;"),
    Fault("a channel of one key is dropped from an aim target", "comp/MAYA_Parse_LookAt.cpp",
          "ExtractAnimInfo(node, kTranslateGroup, n, point);",
          "ExtractAnimInfo(node, kTranslateGroup, n, point);\n"
          "      for (int axis = 0; axis < kAxisCount; ++axis) {\n"
          "        if (NodeChannels::Find(curves, node->curve[axis]).count == 1) point[axis] = node->translate[axis];\n"
          "      }"),
    Fault("the time offset is not reset", "comp/MAYA_Parse_Assembly.cpp",
          "  ResetOffset();\n", ""),
    Fault("batches are closed in the opposite order", "comp/MAYA_Parse_TransformAnimation.cpp",
          "for (VOR_AddKeyframesInfo* const batch : batches) {",
          "for (std::size_t i = kBatchCount; i-- > 0;) {\n    VOR_AddKeyframesInfo* const batch = batches[i];"),
    Fault("the film size is that of the other aperture", "comp/MAYA_Parse_Camera.cpp",
          "camera->cameraAperture[1] : camera->cameraAperture[0]", "camera->cameraAperture[0] : camera->cameraAperture[1]"),
    Fault("kilometres are mended", "comp/MAYA_Parse_SceneUnits.cpp",
          "return distance * 1000.0 * 100.0 * kPointsPerInch;", "return distance * 1000.0 * 100.0 / 2.54 * kPointsPerInch;"),
    Fault("the default perspective camera is recognised with its case", "comp/MAYA_Parse_Assembly.cpp",
          "SameWord(camera.name, kPerspectiveCamera)", "camera.name == kPerspectiveCamera"),
    Fault("the width in square pixels is not rounded", "comp/MAYA_Parse_Assembly.cpp",
          "return TruncateToInt32(scaled + 0.5);", "return TruncateToInt32(scaled);"),
    Fault("every null becomes the parent of the first layer", "comp/MAYA_Parse_Layers.cpp",
          "    child = null;\n", ""),
    Fault("a constraint without a target aims", "comp/MAYA_Parse_Layers.cpp",
          " || record.curve[kTargetSlot] < 0) continue;", ") continue;"),
    Fault("angles half a turn apart are left so", "comp/UnwrapAngle.cpp",
          "while (angle - previous >= kHalfTurn)", "while (angle - previous > kHalfTurn)"),

    # --- refhost/ ---
    Fault("the ledger forgets batches", "refhost/LedgerReport.cpp",
          "for (const auto& [number, batch] : host.batches.held()) {",
          "for (const auto& [number, batch] : host.batches.held()) {\n    if (number != 0) continue;"),
    Fault("of keys at one time the earlier stays", "refhost/Batches.cpp",
          "place + 1 < order.size() && !timeLess(times[order[place]], times[order[place + 1]]);",
          "place > 0 && !timeLess(times[order[place - 1]], times[order[place]]);"),
    Fault("a key that got no value is kept", "refhost/Batches.cpp",
          "if (batch.valued[key] == 0) continue;", ""),
    Fault("a film size of 0 is taken", "refhost/CameraSuite.cpp",
          "if (*filmSize <= 0.0 &&", "if (*filmSize < 0.0 &&"),
    Fault("a layer can become its own parent", "refhost/ProjectEditor.cpp",
          "if (&layer == &other) return true;", "if (&layer == &other) return false;"),

    # --- tools/mayascene/ ---
    Fault("the JSON drops the sign of a negative zero", "text/JsonWriter.cpp",
          "if (value == 0.0 && std::signbit(value)) return literal(\"-0.0\");",
          "if (value == 0.0 && std::signbit(value)) return literal(\"0\");"),
    Fault("the status of several scenes is that of the last", "tools/mayascene/ImportCommand.cpp",
          "status = worse(status, report.status);", "status = report.status;"),
    Fault("an output replaces the link that leads to it", "text/FileBeside.cpp",
          "place_ = WithoutLinks(target).string();",
          "place_ = WithoutLinks(target).empty() ? std::string() : target;"),
    Fault("characters that turn the direction of text reach the terminal", "diag/ShownText.cpp",
          "(point >= 0x2028 && point <= 0x202e)", "(point >= 0x2028 && point <= 0x2029)"),
)
