#pragma once

// Estate tables through GDAL/OGR: any vector layer GDAL reads (a CSV file, a
// GeoPackage, a Shapefile ...) as rows of text, and the tables the estate
// writes (CSV, or a GeoPackage carrying the input's geometry).

#include "estate/estaterun.hpp"
#include "estate/resulttable.hpp"

#include <stdexcept>
#include <string>
#include <vector>

namespace arbolex::estateio {

/// An input that cannot be read, or an output that cannot be written; the
/// text says which file and why.
struct GdalError : std::runtime_error {
    using std::runtime_error::runtime_error;
};

/// The rows of one layer of a vector dataset, every value as text.
class LayerReader : public estate::IRowSource {
public:
    /// Opens `path` and its layer `layerName` (empty: the first). With
    /// `keepGeometry`, each row carries its feature's geometry. Throws GdalError.
    LayerReader(const std::string &path, const std::string &layerName, bool keepGeometry);
    ~LayerReader() override;
    LayerReader(const LayerReader &) = delete;
    LayerReader &operator=(const LayerReader &) = delete;

    const std::vector<std::string> &columnNames() const { return m_names; }
    /// True for a table without geometry (a CSV file).
    bool isTable() const { return m_isTable; }
    /// True for a CSV file whose fields are separated by semicolons (as GDAL
    /// finds the separator in the header line): its numbers may be written
    /// with a decimal comma.
    bool decimalComma() const { return m_decimalComma; }
    /// Rows of the layer, or -1 when the driver cannot tell quickly (a CSV
    /// file is scanned once, without reading its fields).
    long long rowCount() const;
    /// Spatial reference of the layer (may be null), for a writer.
    void *spatialReference() const;
    /// Geometry type of the layer (OGRwkbGeometryType), for a writer.
    int geometryType() const;

    bool next(estate::EstateRow &row) override;

private:
    void *m_dataset = nullptr;
    void *m_layer = nullptr;
    std::vector<std::string> m_names;
    bool m_isTable = false;
    bool m_decimalComma = false;
    bool m_keepGeometry = false;
    long long m_read = 0;
};

/// A GeoPackage layer written through GDAL: typed columns and a geometry per row.
class TableWriter {
public:
    struct Geometry {
        /// OGRSpatialReferenceH of the layer (may be null).
        void *spatialReference = nullptr;
        /// OGRwkbGeometryType of the layer.
        int type = 0;
    };
    /// Creates `path` (replacing a file of that name) with `columns`. Throws GdalError.
    TableWriter(const std::string &path, const std::vector<estate::ResultColumn> &columns,
                const Geometry &geometry);
    ~TableWriter();
    TableWriter(const TableWriter &) = delete;
    TableWriter &operator=(const TableWriter &) = delete;

    /// Writes one row; `geometry` (an OGR geometry, may be null) is copied.
    /// Throws GdalError.
    void write(const std::vector<std::string> &values, const void *geometry);
    /// Writes what is buffered and closes the file. Throws GdalError.
    void close();

private:
    void *m_dataset = nullptr;
    void *m_layer = nullptr;
    void *m_feature = nullptr;
    std::vector<estate::ColumnType> m_types;
    long long m_inTransaction = 0;
    std::string m_path;
};

/// The layout of the reader's columns, with the decimal comma of its file
/// (estate::layoutOf).
std::optional<estate::Layout> layoutOf(const LayerReader &reader, std::string &problem);

/// The files of the dataset at `path` (a Shapefile's .shp, .dbf, .shx …);
/// empty when it cannot be opened.
std::vector<std::string> datasetFiles(const std::string &path);

/// Every row of the first layer of `path`, as text (for reading back the
/// estate's own tables). Throws GdalError.
std::vector<std::vector<std::string>> readTable(const std::string &path,
                                                std::vector<std::string> *columnNames = nullptr);

} // namespace arbolex::estateio
