#include "exports/DxfExport.h"

#include <dxflib/dl_dxf.h>

#include <algorithm>
#include <charconv>
#include <cmath>
#include <cstdio>
#include <memory>
#include <utility>

#include "exports/BulgeArc.h"
#include "exports/ExportText.h"
#include "platform/text/WideText.h"

namespace nedit {

namespace {

constexpr double kDegreesPerRadian = 180.0 / 3.14159265358979323846;
constexpr int kColourByLayer = 256;
constexpr int kColourWhite = 7;
constexpr int kInsUnitsFeet = 2;
constexpr int kInsUnitsMetres = 6;

// Text as DXF of any release reads it: ASCII as it is, other letters as \U+XXXX.
std::string DxfString(const std::string& utf8) {
    std::string out;
    for (const wchar_t c : FromUtf8(utf8)) {
        if (c >= 0x20 && c < 0x7F) {
            out += static_cast<char>(c);
        } else if (c >= 0x80) {
            char escape[16];
            std::snprintf(escape, sizeof escape, "\\U+%04X", static_cast<unsigned>(c));
            out += escape;
        }
    }
    return out;
}

std::string LayerName(const std::string& layer) {
    if (layer.empty()) return "0";
    std::string name = DxfString(layer);
    for (char& c : name) {
        if (std::string("<>/\":;?*|=`").find(c) != std::string::npos) c = '_';
    }
    return name;
}

double Elevation(const UWPoint& at) {
    return at.HasHeight() ? at.z : 0.0;
}

// dxflib's lines, gathered in memory. dxflib's own writer flushes its file after every line,
// two million writes for 100,000 points; this one takes the same calls and keeps the text, so
// the drawing is written whole as every output is. The base's stream is never written.
class DrawingText : public DL_WriterA {
  public:
    explicit DrawingText(std::string& text)
        : DL_WriterA("/dev/null", DL_Codes::AC1015), text_(text) {}

    void dxfReal(int gc, double value) const override {
        char digits[512];  // any double in fixed notation
        const auto end =
            std::to_chars(digits, digits + sizeof digits, value, std::chars_format::fixed);
        std::string real(digits, end.ptr);
        // A real with its point, as CAD programs write them: 1000.0, not 1000.
        if (real.find('.') == std::string::npos) real += ".0";
        Line(gc, real);
    }
    void dxfInt(int gc, int value) const override { Line(gc, std::to_string(value)); }
    void dxfHex(int gc, int value) const override {
        char digits[16];
        std::snprintf(digits, sizeof digits, "%X", static_cast<unsigned>(value));
        Line(gc, digits);
    }
    void dxfString(int gc, const char* value) const override { Line(gc, value); }
    void dxfString(int gc, const std::string& value) const override { Line(gc, value); }

  private:
    void Line(int gc, const std::string& value) const {
        char code[16];
        std::snprintf(code, sizeof code, "%3d\n", gc);
        text_ += code;
        text_ += value;
        text_ += '\n';
    }

    std::string& text_;
};

class DrawingWriter {
  public:
    DrawingWriter(const JobContents& contents, std::string& text)
        : contents_(contents), writer_(std::make_unique<DrawingText>(text)) {}

    void Write(std::vector<std::string>& messages) {
        Head();
        Tables();
        Blocks();
        writer_->sectionEntities();
        Points();
        Linework();
        writer_->sectionEnd();
        dxf_.writeObjects(*writer_);
        dxf_.writeObjectsEnd(*writer_);
        writer_->dxfEOF();
        if (flat_points_ > 0) {
            messages.push_back(Counted(flat_points_, "point", "points") +
                               " without a height: at elevation 0 in the drawing");
        }
        if (flat_polylines_ > 0) {
            messages.push_back(Counted(flat_polylines_, "polyline", "polylines") +
                               " with vertices of different heights: at elevation 0 (a "
                               "lightweight polyline has one elevation)");
        }
    }

  private:
    void Head() {
        dxf_.writeHeader(*writer_);
        writer_->dxfString(9, "$INSUNITS");
        writer_->dxfInt(
            70, contents_.lengthUnit == LengthUnit::Metres ? kInsUnitsMetres : kInsUnitsFeet);
        writer_->sectionEnd();
    }

    void Tables() {
        DL_WriterA& w = *writer_;
        w.sectionTables();
        dxf_.writeVPort(w);
        w.tableLinetypes(3);
        dxf_.writeLinetype(w, DL_LinetypeData("BYBLOCK", "", 0, 0, 0.0));
        dxf_.writeLinetype(w, DL_LinetypeData("BYLAYER", "", 0, 0, 0.0));
        dxf_.writeLinetype(w, DL_LinetypeData("CONTINUOUS", "Solid line", 0, 0, 0.0));
        w.tableEnd();
        w.tableLayers(static_cast<int>(contents_.layers.size()) + 1);
        const DL_Attributes layer_look("", kColourWhite, 0, "CONTINUOUS", 1.0);
        dxf_.writeLayer(w, DL_LayerData("0", 0), layer_look);
        for (const std::string& layer : contents_.layers)
            dxf_.writeLayer(w, DL_LayerData(LayerName(layer), 0), layer_look);
        w.tableEnd();
        w.tableStyle(1);
        dxf_.writeStyle(w,
                        DL_StyleData("standard", 0, 0.0, 1.0, 0.0, 0, kDxfTextHeight, "txt", ""));
        w.tableEnd();
        dxf_.writeView(w);
        dxf_.writeUcs(w);
        w.tableAppid(1);
        dxf_.writeAppid(w, "ACAD");
        w.tableEnd();
        dxf_.writeDimStyle(w, 1, 1, 1, 1, 1);
        dxf_.writeBlockRecord(w);
        w.tableEnd();
        w.sectionEnd();
    }

    void Blocks() {
        DL_WriterA& w = *writer_;
        w.sectionBlocks();
        for (const char* block : {"*Model_Space", "*Paper_Space", "*Paper_Space0"}) {
            dxf_.writeBlock(w, DL_BlockData(block, 0, 0.0, 0.0, 0.0));
            dxf_.writeEndBlock(w, block);
        }
        w.sectionEnd();
    }

    DL_Attributes On(const std::string& layer) const {
        return DL_Attributes(LayerName(layer), kColourByLayer, -1, "BYLAYER", 1.0);
    }

    void Label(const UWPoint& at, double drop, const std::string& text, const DL_Attributes& look) {
        if (text.empty()) return;
        const double x = at.x + kDxfTextHeight / 2.0;
        const double y = at.y + drop;
        dxf_.writeText(*writer_,
                       DL_TextData(x, y, Elevation(at), x, y, Elevation(at), kDxfTextHeight, 1.0, 0,
                                   0, 0, DxfString(text), "standard", 0.0),
                       look);
    }

    void Points() {
        for (const ExportPoint& point : contents_.points) {
            const UWPoint& at = point.point.at;
            if (!at.HasHeight()) ++flat_points_;
            const DL_Attributes look = On(point.layer);
            dxf_.writePoint(*writer_, DL_PointData(at.x, at.y, Elevation(at)), look);
            Label(at, kDxfTextHeight / 4.0, point.point.name, look);
            Label(at, -kDxfTextHeight * 1.25, point.code, look);
        }
    }

    void Linework() {
        for (const ExportLine& line : contents_.lines) {
            const UWPoint& a = line.from.at;
            const UWPoint& b = line.to.at;
            dxf_.writeLine(*writer_, DL_LineData(a.x, a.y, Elevation(a), b.x, b.y, Elevation(b)),
                           On(line.layer));
        }
        for (const ExportArc& arc : contents_.arcs) Arc(arc);
        for (const ExportCircle& circle : contents_.circles) {
            const UWPoint& c = circle.centre.at;
            dxf_.writeCircle(*writer_, DL_CircleData(c.x, c.y, Elevation(c), circle.radius),
                             On(circle.layer));
        }
        for (const ExportPolyline& polyline : contents_.polylines) Polyline(polyline);
    }

    void Arc(const ExportArc& arc) {
        const BulgeArc shape(arc.start.at, arc.end.at, arc.bulge);
        if (!shape.IsArc()) {  // no circle through its points: its chord
            const UWPoint& a = arc.start.at;
            const UWPoint& b = arc.end.at;
            dxf_.writeLine(*writer_, DL_LineData(a.x, a.y, Elevation(a), b.x, b.y, Elevation(b)),
                           On(arc.layer));
            return;
        }
        // An ARC runs anticlockwise from its first angle to its second.
        double first = shape.StartAngle() * kDegreesPerRadian;
        double second = shape.EndAngle() * kDegreesPerRadian;
        if (shape.IsClockwise()) std::swap(first, second);
        const UWPoint& c = arc.centre;
        dxf_.writeArc(*writer_,
                      DL_ArcData(c.x, c.y, Elevation(arc.start.at), arc.radius, first, second),
                      On(arc.layer));
    }

    void Polyline(const ExportPolyline& polyline) {
        if (polyline.vertices.size() < 2) return;  // the job never keeps one, but no leg
        auto vertices = polyline.vertices;
        // A closed LWPOLYLINE returns to its first vertex by itself.
        if (polyline.closed) vertices.pop_back();
        const double first = Elevation(vertices.front().first.at);
        const bool level = std::all_of(vertices.begin(), vertices.end(), [first](const auto& v) {
            return Elevation(v.first.at) == first;
        });
        const double elevation = level ? first : 0.0;
        if (!level) ++flat_polylines_;
        dxf_.writePolyline(*writer_,
                           DL_PolylineData(static_cast<int>(vertices.size()), 0, 0,
                                           polyline.closed ? 1 : 0, elevation),
                           On(polyline.layer));
        for (const auto& [vertex, bulge] : vertices) {
            dxf_.writeVertex(*writer_, DL_VertexData(vertex.at.x, vertex.at.y, elevation, -bulge));
        }
        dxf_.writePolylineEnd(*writer_);
    }

    const JobContents& contents_;
    DL_Dxf dxf_;
    std::unique_ptr<DL_WriterA> writer_;
    std::size_t flat_points_ = 0;
    std::size_t flat_polylines_ = 0;
};

}  // namespace

std::string DxfText(const JobContents& contents, std::vector<std::string>& messages) {
    std::string text;
    DrawingWriter(contents, text).Write(messages);
    return text;
}

}  // namespace nedit
