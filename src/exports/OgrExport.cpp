#include "exports/OgrExport.h"

#include <cpl_string.h>
#include <gdal_priv.h>
#include <ogr_geometry.h>
#include <ogr_spatialref.h>
#include <ogrsf_frmts.h>

#include <atomic>
#include <memory>
#include <mutex>
#include <stdexcept>

#include "exports/BulgeArc.h"
#include "exports/JobCrs.h"
#include "exports/PointAttributes.h"

namespace nedit {

namespace {

using Legs = std::vector<std::pair<UWPoint, double>>;  // each vertex with the bulge after it

struct DriverOf {
    ExportFormat format;
    const char* driver;
    const char* file;  // the dataset's name in memory
};

constexpr DriverOf kDrivers[] = {{ExportFormat::GeoPackage, "GPKG", "export.gpkg"},
                                 {ExportFormat::GeoJson, "GeoJSON", "export.geojson"},
                                 {ExportFormat::Shapefile, "ESRI Shapefile", "export.shp"},
                                 {ExportFormat::Kml, "KML", "export.kml"}};

const DriverOf& DriverFor(ExportFormat format) {
    for (const DriverOf& driver : kDrivers) {
        if (driver.format == format) return driver;
    }
    throw std::logic_error("no GIS driver for " + ExportFormatTitle(format));
}

void RegisterDrivers() {
    static std::once_flag once;
    std::call_once(once, [] { GDALAllRegister(); });
}

std::string LastGdalError(const std::string& what) {
    const char* why = CPLGetLastErrorMsg();
    return what + (why != nullptr && *why != '\0' ? ": " + std::string(why) : "");
}

// GDAL's warnings and errors go to the messages while the export runs, never to a terminal.
class GdalMessages {
  public:
    explicit GdalMessages(std::vector<std::string>& messages) {
        CPLPushErrorHandlerEx(Collect, &messages);
        CPLErrorReset();
    }
    ~GdalMessages() { CPLPopErrorHandler(); }
    GdalMessages(const GdalMessages&) = delete;
    GdalMessages& operator=(const GdalMessages&) = delete;

  private:
    static void CPL_STDCALL Collect(CPLErr level, CPLErrorNum, const char* text) {
        if (level < CE_Warning) return;
        static_cast<std::vector<std::string>*>(CPLGetErrorHandlerUserData())
            ->push_back(std::string("GDAL: ") + text);
    }
};

// A folder in GDAL's memory for one export, removed with what is in it.
class MemoryFolder {
  public:
    MemoryFolder() {
        static std::atomic<int> count{0};
        path_ = "/vsimem/sxnedit-export-" + std::to_string(++count) + "/";
    }
    ~MemoryFolder() { VSIRmdirRecursive(path_.c_str()); }
    MemoryFolder(const MemoryFolder&) = delete;
    MemoryFolder& operator=(const MemoryFolder&) = delete;
    std::string File(const std::string& name) const { return path_ + name; }

  private:
    std::string path_;
};

bool AllHaveHeights(const Legs& legs) {
    for (const auto& leg : legs) {
        if (!leg.first.HasHeight()) return false;
    }
    return true;
}

void Add(OGRSimpleCurve& curve, const UWPoint& at, bool threeD) {
    if (threeD) {
        curve.addPoint(at.x, at.y, at.z);
    } else {
        curve.addPoint(at.x, at.y);
    }
}

void Append(OGRCompoundCurve& compound, std::unique_ptr<OGRCurve> piece) {
    if (compound.addCurveDirectly(piece.get()) != OGRERR_NONE)
        throw std::runtime_error("the pieces of a curve do not join");
    piece.release();
}

// Straight legs as line strings, arcs as circular strings through their middles.
std::unique_ptr<OGRGeometry> CurveOf(const Legs& legs) {
    const bool threeD = AllHaveHeights(legs);
    auto compound = std::make_unique<OGRCompoundCurve>();
    std::unique_ptr<OGRLineString> straight;
    for (std::size_t i = 0; i + 1 < legs.size(); ++i) {
        const UWPoint& from = legs[i].first;
        const UWPoint& to = legs[i + 1].first;
        const BulgeArc arc(from, to, legs[i].second);
        if (!arc.IsArc()) {
            if (!straight) {
                straight = std::make_unique<OGRLineString>();
                Add(*straight, from, threeD);
            }
            Add(*straight, to, threeD);
            continue;
        }
        if (straight) Append(*compound, std::move(straight));
        auto circular = std::make_unique<OGRCircularString>();
        Add(*circular, from, threeD);
        Add(*circular, arc.PointAt(0.5), threeD);
        Add(*circular, to, threeD);
        Append(*compound, std::move(circular));
    }
    if (straight) Append(*compound, std::move(straight));
    return compound;
}

std::unique_ptr<OGRGeometry> DensifiedOf(const Legs& legs) {
    const bool threeD = AllHaveHeights(legs);
    auto line = std::make_unique<OGRLineString>();
    Add(*line, legs.front().first, threeD);
    for (std::size_t i = 0; i + 1 < legs.size(); ++i) {
        const BulgeArc arc(legs[i].first, legs[i + 1].first, legs[i].second);
        for (const UWPoint& at : arc.Densify(kDensifyTolerance)) Add(*line, at, threeD);
    }
    return line;
}

std::unique_ptr<OGRGeometry> CircleOf(const ExportCircle& circle, bool curves) {
    const UWPoint& c = circle.centre.at;
    const bool threeD = c.HasHeight();
    if (!curves) {
        auto ring = std::make_unique<OGRLineString>();
        for (const UWPoint& at : CircleRing(c, circle.radius, kDensifyTolerance))
            Add(*ring, at, threeD);
        return ring;
    }
    // A whole circle: from the East point through the West point back to the East point.
    auto circular = std::make_unique<OGRCircularString>();
    Add(*circular, UWPoint(c.x + circle.radius, c.y, c.z), threeD);
    Add(*circular, UWPoint(c.x - circle.radius, c.y, c.z), threeD);
    Add(*circular, UWPoint(c.x + circle.radius, c.y, c.z), threeD);
    auto compound = std::make_unique<OGRCompoundCurve>();
    Append(*compound, std::move(circular));
    return compound;
}

class GisWriter {
  public:
    GisWriter(const JobContents& contents, ExportFormat format, const std::string& crs)
        : contents_(contents),
          format_(format),
          curves_(format == ExportFormat::GeoPackage),
          columns_(AttributeColumns(contents.points)) {
        // A Shapefile's text would be Latin-1 otherwise, and lose every other letter.
        if (format == ExportFormat::Shapefile) layer_options_.SetNameValue("ENCODING", "UTF-8");
        if (!crs.empty()) {
            srs_ = std::make_unique<OGRSpatialReference>();
            if (srs_->importFromEPSG(EpsgNumber(crs)) != OGRERR_NONE)
                throw std::runtime_error("GDAL does not know the coordinate system " + crs);
            srs_->SetAxisMappingStrategy(OAMS_TRADITIONAL_GIS_ORDER);
        } else if (format == ExportFormat::Kml) {
            throw std::runtime_error(
                "KML holds longitudes and latitudes: give the job's coordinate system "
                "(--crs EPSG:NNNN)");
        }
    }

    void Write(const MemoryFolder& folder) {
        const DriverOf& driver = DriverFor(format_);
        GDALDriver* gdal = GetGDALDriverManager()->GetDriverByName(driver.driver);
        if (gdal == nullptr) throw std::runtime_error(std::string("GDAL has no ") + driver.driver);
        if (format_ == ExportFormat::Shapefile) {
            // One kind of geometry to a Shapefile: the points and the linework apart.
            Dataset points(*gdal, folder.File(driver.file));
            WritePoints(*PointLayer(points, "points"));
            points.Finish();
            Dataset linework(*gdal, folder.File("export_lines.shp"));
            WriteLinework(*LineworkLayer(linework, "linework"));
            linework.Finish();
        } else if (format_ == ExportFormat::GeoJson) {
            Dataset all(*gdal, folder.File(driver.file));
            OGRLayer& layer = *all.Layer("job", srs_.get(), wkbUnknown, layer_options_.List());
            AddPointFields(layer);
            AddLineworkFields(layer);
            WritePoints(layer);
            WriteLinework(layer);
            all.Finish();
        } else {
            Dataset both(*gdal, folder.File(driver.file));
            WritePoints(*PointLayer(both, "points"));
            WriteLinework(*LineworkLayer(both, "linework"));
            both.Finish();
        }
    }

  private:
    // A dataset being written; closing it writes what is left.
    class Dataset {
      public:
        Dataset(GDALDriver& driver, const std::string& path)
            : dataset_(driver.Create(path.c_str(), 0, 0, 0, GDT_Unknown, nullptr)) {
            if (dataset_ == nullptr) throw std::runtime_error(LastGdalError("GDAL cannot make it"));
            // One transaction where the format has them (GeoPackage), not one per feature.
            in_transaction_ = dataset_->StartTransaction() == OGRERR_NONE;
        }
        ~Dataset() {
            if (dataset_ != nullptr) GDALClose(dataset_);
        }

        /// Commits and closes, which writes what GDAL still holds.
        void Finish() {
            const bool committed = !in_transaction_ || dataset_->CommitTransaction() == OGRERR_NONE;
            CPLErrorReset();
            GDALClose(dataset_);
            const bool closed = CPLGetLastErrorType() < CE_Failure;
            dataset_ = nullptr;
            if (!committed || !closed)
                throw std::runtime_error(LastGdalError("GDAL cannot finish it"));
        }
        Dataset(const Dataset&) = delete;
        Dataset& operator=(const Dataset&) = delete;

        OGRLayer* Layer(const char* name, OGRSpatialReference* srs, OGRwkbGeometryType type,
                        char** options) {
            OGRLayer* layer = dataset_->CreateLayer(name, srs, type, options);
            if (layer == nullptr)
                throw std::runtime_error(LastGdalError("GDAL cannot make a layer"));
            return layer;
        }

      private:
        GDALDataset* dataset_;
        bool in_transaction_ = false;
    };

    static void Field(OGRLayer& layer, const char* name, OGRFieldType type) {
        OGRFieldDefn field(name, type);
        if (layer.CreateField(&field) != OGRERR_NONE)
            throw std::runtime_error(
                LastGdalError(std::string("GDAL cannot make the column ") + name));
    }

    void AddPointFields(OGRLayer& layer) {
        point_fields_ = layer.GetLayerDefn()->GetFieldCount();
        for (const char* name : {"name", "code", "layer", "note"}) Field(layer, name, OFTString);
        Field(layer, "height", OFTReal);
        for (const std::string& name : columns_) Field(layer, name.c_str(), OFTString);
    }

    void AddLineworkFields(OGRLayer& layer) {
        linework_fields_ = layer.GetLayerDefn()->GetFieldCount();
        // In one collection with the points, the linework shares their name and layer.
        if (linework_fields_ > 0) {
            Field(layer, "kind", OFTString);
            return;
        }
        for (const char* name : {"kind", "name", "layer"}) Field(layer, name, OFTString);
    }

    OGRLayer* PointLayer(Dataset& dataset, const char* name) {
        OGRLayer* layer = dataset.Layer(name, srs_.get(), wkbPoint25D, layer_options_.List());
        AddPointFields(*layer);
        return layer;
    }

    OGRLayer* LineworkLayer(Dataset& dataset, const char* name) {
        OGRLayer* layer =
            dataset.Layer(name, srs_.get(), curves_ ? wkbCompoundCurveZ : wkbLineString25D,
                          layer_options_.List());
        AddLineworkFields(*layer);
        return layer;
    }

    static void Store(OGRLayer& layer, OGRFeature& feature, std::unique_ptr<OGRGeometry> shape) {
        feature.SetGeometryDirectly(shape.release());
        if (layer.CreateFeature(&feature) != OGRERR_NONE)
            throw std::runtime_error(LastGdalError("GDAL cannot write a feature"));
    }

    void WritePoints(OGRLayer& layer) {
        for (const ExportPoint& point : contents_.points) {
            OGRFeature feature(layer.GetLayerDefn());
            int field = point_fields_;
            for (const std::string* text :
                 {&point.point.name, &point.code, &point.layer, &point.note})
                feature.SetField(field++, text->c_str());
            const UWPoint& at = point.point.at;
            if (at.HasHeight()) feature.SetField(field, at.z);
            ++field;
            for (const std::string& name : columns_) {
                const std::string value = AttributeValue(point, name);
                if (!value.empty()) feature.SetField(field, value.c_str());
                ++field;
            }
            if (linework_fields_ > 0) feature.SetField(linework_fields_, "point");
            Store(layer, feature,
                  at.HasHeight() ? std::make_unique<OGRPoint>(at.x, at.y, at.z)
                                 : std::make_unique<OGRPoint>(at.x, at.y));
        }
    }

    void Linework(OGRLayer& layer, const char* kind, const std::string& name, const std::string& on,
                  std::unique_ptr<OGRGeometry> shape) {
        OGRFeature feature(layer.GetLayerDefn());
        if (linework_fields_ > 0) {  // beside the points: their name and layer columns
            feature.SetField(point_fields_, name.c_str());
            feature.SetField(point_fields_ + 2, on.c_str());
            feature.SetField(linework_fields_, kind);
        } else {
            feature.SetField(0, kind);
            feature.SetField(1, name.c_str());
            feature.SetField(2, on.c_str());
        }
        Store(layer, feature, std::move(shape));
    }

    std::unique_ptr<OGRGeometry> Shape(const Legs& legs) const {
        return curves_ ? CurveOf(legs) : DensifiedOf(legs);
    }

    void WriteLinework(OGRLayer& layer) {
        for (const ExportLine& line : contents_.lines) {
            Linework(layer, "line", line.from.name + "-" + line.to.name, line.layer,
                     Shape({{line.from.at, 0.0}, {line.to.at, 0.0}}));
        }
        for (const ExportArc& arc : contents_.arcs) {
            Linework(layer, "arc", arc.start.name + "-" + arc.end.name, arc.layer,
                     Shape({{arc.start.at, arc.bulge}, {arc.end.at, 0.0}}));
        }
        for (const ExportCircle& circle : contents_.circles) {
            Linework(layer, "circle", circle.centre.name, circle.layer, CircleOf(circle, curves_));
        }
        for (const ExportPolyline& polyline : contents_.polylines) {
            Legs legs;
            for (const auto& [vertex, bulge] : polyline.vertices)
                legs.emplace_back(vertex.at, bulge);
            if (legs.size() >= 2)
                Linework(layer, "polyline", polyline.name, polyline.layer, Shape(legs));
        }
    }

    const JobContents& contents_;
    ExportFormat format_;
    bool curves_;
    std::vector<std::string> columns_;
    std::unique_ptr<OGRSpatialReference> srs_;
    CPLStringList layer_options_;
    int point_fields_ = 0;
    int linework_fields_ = 0;
};

// The bytes of a file in GDAL's memory; false when there is none.
bool TakeFile(const std::string& path, std::string& bytes) {
    vsi_l_offset size = 0;
    const GByte* data = VSIGetMemFileBuffer(path.c_str(), &size, FALSE);
    if (data == nullptr) return false;
    bytes.assign(reinterpret_cast<const char*>(data), static_cast<std::size_t>(size));
    return true;
}

}  // namespace

ExportFiles OgrFiles(const JobContents& contents, ExportFormat format, const std::string& output,
                     const std::string& crs, std::vector<std::string>& messages) {
    RegisterDrivers();
    const GdalMessages collect(messages);
    const MemoryFolder folder;
    GisWriter(contents, format, crs).Write(folder);
    ExportFiles files;
    std::string bytes;
    if (format != ExportFormat::Shapefile) {
        if (!TakeFile(folder.File(DriverFor(format).file), bytes))
            throw std::runtime_error(LastGdalError("GDAL wrote no " + ExportFormatTitle(format)));
        files.emplace_back(output, std::move(bytes));
        return files;
    }
    const std::string stem = ShapefileStem(output);
    for (const std::string& path : ExportOutputs(format, output)) {
        // The companions keep their endings after "export" or "export_lines" in memory.
        const std::string name = "export" + path.substr(stem.size());
        if (TakeFile(folder.File(name), bytes)) files.emplace_back(path, std::move(bytes));
    }
    return files;
}

std::string WhyUnknownCrs(const std::string& crs) {
    RegisterDrivers();
    std::vector<std::string> messages;
    const GdalMessages collect(messages);
    OGRSpatialReference srs;
    if (srs.importFromEPSG(EpsgNumber(crs)) == OGRERR_NONE) return {};
    return "GDAL does not know the coordinate system " + crs;
}

}  // namespace nedit
