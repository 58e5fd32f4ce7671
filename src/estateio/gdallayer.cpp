#include "estateio/gdallayer.hpp"

#include <cpl_conv.h>
#include <cpl_csv.h>
#include <cpl_error.h>
#include <cpl_vsi.h>
#include <gdal.h>
#include <ogr_api.h>
#include <ogr_srs_api.h>

#include <mutex>

namespace arbolex::estateio {

namespace {

/// Features written between two commits of a GeoPackage: one transaction per
/// feature would make a large estate crawl.
constexpr long long kFeaturesPerTransaction = 20000;

void registerDrivers() {
    static std::once_flag once;
    std::call_once(once, [] {
        GDALAllRegister();
        // GDAL's warnings would interleave with the progress line; its
        // failures are read back with CPLGetLastErrorMsg.
        CPLSetErrorHandler(CPLQuietErrorHandler);
    });
}

std::string lastError(const std::string &lead) {
    const char *why = CPLGetLastErrorMsg();
    return why != nullptr && *why != '\0' ? lead + ": " + why : lead;
}

OGRFieldType fieldType(estate::ColumnType type) {
    switch (type) {
    case estate::ColumnType::kInteger:
        return OFTInteger64;
    case estate::ColumnType::kReal:
        return OFTReal;
    case estate::ColumnType::kText:
        return OFTString;
    }
    return OFTString;
}

/// The separator of a CSV file as GDAL's CSV driver finds it in the first
/// line (a UTF-8 byte-order mark before it is skipped, as the driver does).
char csvSeparator(const char *path) {
    VSILFILE *file = VSIFOpenL(path, "rb");
    if (file == nullptr) {
        return ',';
    }
    const char *line = CPLReadLineL(file);
    std::string header = line != nullptr ? line : "";
    VSIFCloseL(file);
    if (header.rfind("\xEF\xBB\xBF", 0) == 0) {
        header.erase(0, 3);
    }
    return CSVDetectSeperator(header.c_str());
}

} // namespace

LayerReader::LayerReader(const std::string &path, const std::string &layerName, bool keepGeometry)
    : m_keepGeometry(keepGeometry) {
    registerDrivers();
    CPLErrorReset();
    m_dataset =
        GDALOpenEx(path.c_str(), GDAL_OF_VECTOR | GDAL_OF_READONLY, nullptr, nullptr, nullptr);
    if (m_dataset == nullptr) {
        throw GdalError(lastError("cannot read \"" + path + "\" as a table or vector layer"));
    }
    m_layer = layerName.empty() ? GDALDatasetGetLayer(m_dataset, 0)
                                : GDALDatasetGetLayerByName(m_dataset, layerName.c_str());
    if (m_layer == nullptr) {
        GDALClose(m_dataset);
        throw GdalError(layerName.empty() ? "\"" + path + "\" has no layer"
                                          : "\"" + path + "\" has no layer \"" + layerName + "\"");
    }
    OGRFeatureDefnH definition = OGR_L_GetLayerDefn(m_layer);
    for (int i = 0; i < OGR_FD_GetFieldCount(definition); ++i) {
        m_names.emplace_back(OGR_Fld_GetNameRef(OGR_FD_GetFieldDefn(definition, i)));
    }
    const char *driver = GDALGetDriverShortName(GDALGetDatasetDriver(m_dataset));
    m_isTable = std::string(driver) == "CSV";
    if (m_isTable) {
        char **files = GDALGetFileList(m_dataset);
        m_decimalComma = files != nullptr && files[0] != nullptr && csvSeparator(files[0]) == ';';
        CSLDestroy(files);
    }
}

LayerReader::~LayerReader() {
    if (m_dataset != nullptr) {
        GDALClose(m_dataset);
    }
}

long long LayerReader::rowCount() const {
    return OGR_L_GetFeatureCount(m_layer, FALSE);
}

void *LayerReader::spatialReference() const {
    return OGR_L_GetSpatialRef(m_layer);
}

int LayerReader::geometryType() const {
    return static_cast<int>(OGR_L_GetGeomType(m_layer));
}

bool LayerReader::next(estate::EstateRow &row) {
    OGRFeatureH feature = OGR_L_GetNextFeature(m_layer);
    if (feature == nullptr) {
        if (CPLGetLastErrorType() >= CE_Failure) {
            throw GdalError(lastError("the input could not be read to its end"));
        }
        return false;
    }
    ++m_read;
    // A table's header is its line 1.
    row.line = m_isTable ? m_read + 1 : m_read;
    const int count = OGR_F_GetFieldCount(feature);
    row.values.resize(static_cast<std::size_t>(count));
    for (int i = 0; i < count; ++i) {
        std::string &value = row.values[static_cast<std::size_t>(i)];
        if (OGR_F_IsFieldSetAndNotNull(feature, i) != 0) {
            value.assign(OGR_F_GetFieldAsString(feature, i));
        } else {
            value.clear();
        }
    }
    row.extra.reset();
    if (m_keepGeometry) {
        if (OGRGeometryH geometry = OGR_F_StealGeometry(feature)) {
            row.extra = std::shared_ptr<void>(
                geometry, [](void *g) { OGR_G_DestroyGeometry(static_cast<OGRGeometryH>(g)); });
        }
    }
    OGR_F_Destroy(feature);
    return true;
}

TableWriter::TableWriter(const std::string &path, const std::vector<estate::ResultColumn> &columns,
                         const Geometry &geometry)
    : m_path(path) {
    registerDrivers();
    CPLErrorReset();
    GDALDriverH driver = GDALGetDriverByName("GPKG");
    if (driver == nullptr) {
        throw GdalError("GDAL has no GeoPackage driver");
    }
    VSIUnlink(path.c_str());
    m_dataset = GDALCreate(driver, path.c_str(), 0, 0, 0, GDT_Unknown, nullptr);
    if (m_dataset == nullptr) {
        throw GdalError(lastError("cannot create \"" + path + "\""));
    }
    const std::string name = CPLGetBasename(path.c_str());
    m_layer = GDALDatasetCreateLayer(m_dataset, name.c_str(),
                                     static_cast<OGRSpatialReferenceH>(geometry.spatialReference),
                                     static_cast<OGRwkbGeometryType>(geometry.type), nullptr);
    if (m_layer == nullptr) {
        GDALClose(m_dataset);
        throw GdalError(lastError("cannot create a layer in \"" + path + "\""));
    }
    for (const estate::ResultColumn &c : columns) {
        OGRFieldDefnH field = OGR_Fld_Create(c.name.c_str(), fieldType(c.type));
        const OGRErr made = OGR_L_CreateField(m_layer, field, TRUE);
        OGR_Fld_Destroy(field);
        if (made != OGRERR_NONE) {
            GDALClose(m_dataset);
            throw GdalError(
                lastError("cannot add the column \"" + c.name + "\" to \"" + path + "\""));
        }
        m_types.push_back(c.type);
    }
    m_feature = OGR_F_Create(OGR_L_GetLayerDefn(m_layer));
}

TableWriter::~TableWriter() {
    if (m_feature != nullptr) {
        OGR_F_Destroy(m_feature);
    }
    if (m_dataset != nullptr) {
        if (m_inTransaction > 0) {
            GDALDatasetCommitTransaction(m_dataset);
        }
        GDALClose(m_dataset);
    }
}

void TableWriter::write(const std::vector<std::string> &values, const void *geometry) {
    if (m_inTransaction == 0) {
        GDALDatasetStartTransaction(m_dataset, FALSE);
    }
    auto *feature = static_cast<OGRFeatureH>(m_feature);
    OGR_F_SetFID(feature, OGRNullFID);
    for (std::size_t i = 0; i < values.size() && i < m_types.size(); ++i) {
        const int field = static_cast<int>(i);
        if (values[i].empty() && m_types[i] != estate::ColumnType::kText) {
            OGR_F_SetFieldNull(feature, field);
        } else {
            OGR_F_SetFieldString(feature, field, values[i].c_str());
        }
    }
    // OGR copies the geometry and never changes the one it is given.
    OGR_F_SetGeometry(feature, static_cast<OGRGeometryH>(const_cast<void *>(geometry)));
    if (OGR_L_CreateFeature(m_layer, feature) != OGRERR_NONE) {
        throw GdalError(lastError("cannot write to \"" + m_path + "\""));
    }
    if (++m_inTransaction == kFeaturesPerTransaction) {
        GDALDatasetCommitTransaction(m_dataset);
        m_inTransaction = 0;
    }
}

void TableWriter::close() {
    if (m_dataset == nullptr) {
        return;
    }
    CPLErrorReset();
    if (m_inTransaction > 0 && GDALDatasetCommitTransaction(m_dataset) != OGRERR_NONE) {
        throw GdalError(lastError("cannot write to \"" + m_path + "\""));
    }
    m_inTransaction = 0;
    OGR_F_Destroy(m_feature);
    m_feature = nullptr;
    GDALClose(m_dataset);
    m_dataset = nullptr;
    if (CPLGetLastErrorType() >= CE_Failure) {
        throw GdalError(lastError("cannot write to \"" + m_path + "\""));
    }
}

std::optional<estate::Layout> layoutOf(const LayerReader &reader, std::string &problem) {
    std::optional<estate::Layout> layout = estate::layoutOf(reader.columnNames(), problem);
    if (layout) {
        layout->decimalComma = reader.decimalComma();
    }
    return layout;
}

std::vector<std::string> datasetFiles(const std::string &path) {
    registerDrivers();
    std::vector<std::string> out;
    GDALDatasetH dataset =
        GDALOpenEx(path.c_str(), GDAL_OF_VECTOR | GDAL_OF_READONLY, nullptr, nullptr, nullptr);
    if (dataset == nullptr) {
        return out;
    }
    char **files = GDALGetFileList(dataset);
    for (char **f = files; f != nullptr && *f != nullptr; ++f) {
        out.emplace_back(*f);
    }
    CSLDestroy(files);
    GDALClose(dataset);
    return out;
}

std::vector<std::vector<std::string>> readTable(const std::string &path,
                                                std::vector<std::string> *columnNames) {
    LayerReader reader(path, {}, false);
    if (columnNames != nullptr) {
        *columnNames = reader.columnNames();
    }
    std::vector<std::vector<std::string>> rows;
    estate::EstateRow row;
    while (reader.next(row)) {
        rows.push_back(row.values);
    }
    return rows;
}

} // namespace arbolex::estateio
