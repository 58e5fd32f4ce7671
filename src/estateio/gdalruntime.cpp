// GDAL loaded when an estate file is first opened, not when a program starts.
//
// GDAL brings well over a hundred shared libraries with it; resolving their
// symbols and running their initialisers costs a program that never reads a
// GIS layer more than its whole work (the optimiser of one stand, the desktop
// program's start-up). The programs are therefore not linked to GDAL: each
// GDAL function this library calls is defined here and forwards to the
// function of the same name in the GDAL library, which the first call loads.
// A GDAL function called elsewhere in this library must be added below (the
// link fails until it is). When GDAL cannot be loaded, the first call throws
// GdalError, which the estate's callers report as they report a file GDAL
// cannot read (docs/performance.md).
#include "estateio/gdallayer.hpp"

#include <cpl_conv.h>
#include <cpl_csv.h>
#include <cpl_error.h>
#include <cpl_string.h>
#include <cpl_vsi.h>
#include <gdal.h>
#include <ogr_api.h>
#include <ogr_srs_api.h>

#include <dlfcn.h>

#include <mutex>
#include <string>

namespace arbolex::estateio {

namespace {

/// The GDAL library, loaded once; throws GdalError when it cannot be.
void *gdalLibrary() {
    static void *library = nullptr;
    static std::string failure;
    static std::once_flag once;
    std::call_once(once, [] {
        library = dlopen(ARBOLEX_GDAL_LIBRARY, RTLD_NOW | RTLD_LOCAL);
        if (library == nullptr) {
            const char *why = dlerror();
            failure = std::string("GDAL (" ARBOLEX_GDAL_LIBRARY ") cannot be loaded") +
                      (why != nullptr ? std::string(": ") + why : std::string());
        }
    });
    if (library == nullptr) {
        throw GdalError(failure);
    }
    return library;
}

/// GDAL's function `name`, as a pointer of type F.
template <typename F> F gdalFunction(const char *name) {
    void *symbol = dlsym(gdalLibrary(), name);
    if (symbol == nullptr) {
        throw GdalError(std::string("GDAL has no function ") + name);
    }
    return reinterpret_cast<F>(symbol);
}

} // namespace

} // namespace arbolex::estateio

/// Defines GDAL's function `name` (returning `Result`, taking `Parameters`) as
/// a call of the loaded library's, passing `Arguments`. `Parameters` is a
/// parameter list, which no parentheses may enclose.
// NOLINTBEGIN(bugprone-macro-parentheses)
#define ARBOLEX_GDAL_FUNCTION(Result, name, Parameters, Arguments)                                 \
    extern "C" Result name Parameters {                                                            \
        using Function = Result(*) Parameters;                                                     \
        static const Function f = arbolex::estateio::gdalFunction<Function>(#name);                \
        return f Arguments;                                                                        \
    }
// NOLINTEND(bugprone-macro-parentheses)

ARBOLEX_GDAL_FUNCTION(char, CSVDetectSeperator, (const char *line), (line))
ARBOLEX_GDAL_FUNCTION(void, CSLDestroy, (char **list), (list))
ARBOLEX_GDAL_FUNCTION(void, CPLErrorReset, (), ())
ARBOLEX_GDAL_FUNCTION(const char *, CPLGetBasename, (const char *path), (path))
ARBOLEX_GDAL_FUNCTION(const char *, CPLGetLastErrorMsg, (), ())
ARBOLEX_GDAL_FUNCTION(CPLErr, CPLGetLastErrorType, (), ())
ARBOLEX_GDAL_FUNCTION(void, CPLQuietErrorHandler,
                      (CPLErr error, CPLErrorNum number, const char *message),
                      (error, number, message))
ARBOLEX_GDAL_FUNCTION(CPLErrorHandler, CPLSetErrorHandler, (CPLErrorHandler handler), (handler))
ARBOLEX_GDAL_FUNCTION(void, GDALAllRegister, (), ())
ARBOLEX_GDAL_FUNCTION(void, GDALClose, (GDALDatasetH dataset), (dataset))
ARBOLEX_GDAL_FUNCTION(GDALDatasetH, GDALCreate,
                      (GDALDriverH driver, const char *path, int width, int height, int bands,
                       GDALDataType type, CSLConstList options),
                      (driver, path, width, height, bands, type, options))
ARBOLEX_GDAL_FUNCTION(OGRErr, GDALDatasetCommitTransaction, (GDALDatasetH dataset), (dataset))
ARBOLEX_GDAL_FUNCTION(OGRLayerH, GDALDatasetCreateLayer,
                      (GDALDatasetH dataset, const char *name, OGRSpatialReferenceH reference,
                       OGRwkbGeometryType type, CSLConstList options),
                      (dataset, name, reference, type, options))
ARBOLEX_GDAL_FUNCTION(OGRLayerH, GDALDatasetGetLayer, (GDALDatasetH dataset, int index),
                      (dataset, index))
ARBOLEX_GDAL_FUNCTION(OGRLayerH, GDALDatasetGetLayerByName,
                      (GDALDatasetH dataset, const char *name), (dataset, name))
ARBOLEX_GDAL_FUNCTION(OGRErr, GDALDatasetStartTransaction, (GDALDatasetH dataset, int force),
                      (dataset, force))
ARBOLEX_GDAL_FUNCTION(GDALDriverH, GDALGetDatasetDriver, (GDALDatasetH dataset), (dataset))
ARBOLEX_GDAL_FUNCTION(GDALDriverH, GDALGetDriverByName, (const char *name), (name))
ARBOLEX_GDAL_FUNCTION(const char *, GDALGetDriverShortName, (GDALDriverH driver), (driver))
ARBOLEX_GDAL_FUNCTION(char **, GDALGetFileList, (GDALDatasetH dataset), (dataset))
ARBOLEX_GDAL_FUNCTION(GDALDatasetH, GDALOpenEx,
                      (const char *path, unsigned int flags, const char *const *drivers,
                       const char *const *options, const char *const *siblings),
                      (path, flags, drivers, options, siblings))
ARBOLEX_GDAL_FUNCTION(int, OGR_FD_GetFieldCount, (OGRFeatureDefnH definition), (definition))
ARBOLEX_GDAL_FUNCTION(OGRFieldDefnH, OGR_FD_GetFieldDefn, (OGRFeatureDefnH definition, int field),
                      (definition, field))
ARBOLEX_GDAL_FUNCTION(OGRFeatureH, OGR_F_Create, (OGRFeatureDefnH definition), (definition))
ARBOLEX_GDAL_FUNCTION(void, OGR_F_Destroy, (OGRFeatureH feature), (feature))
ARBOLEX_GDAL_FUNCTION(const char *, OGR_F_GetFieldAsString, (OGRFeatureH feature, int field),
                      (feature, field))
ARBOLEX_GDAL_FUNCTION(int, OGR_F_GetFieldCount, (OGRFeatureH feature), (feature))
ARBOLEX_GDAL_FUNCTION(int, OGR_F_IsFieldSetAndNotNull, (OGRFeatureH feature, int field),
                      (feature, field))
ARBOLEX_GDAL_FUNCTION(OGRErr, OGR_F_SetFID, (OGRFeatureH feature, GIntBig id), (feature, id))
ARBOLEX_GDAL_FUNCTION(void, OGR_F_SetFieldNull, (OGRFeatureH feature, int field), (feature, field))
ARBOLEX_GDAL_FUNCTION(void, OGR_F_SetFieldString,
                      (OGRFeatureH feature, int field, const char *value), (feature, field, value))
ARBOLEX_GDAL_FUNCTION(OGRErr, OGR_F_SetGeometry, (OGRFeatureH feature, OGRGeometryH geometry),
                      (feature, geometry))
ARBOLEX_GDAL_FUNCTION(OGRGeometryH, OGR_F_StealGeometry, (OGRFeatureH feature), (feature))
ARBOLEX_GDAL_FUNCTION(OGRFieldDefnH, OGR_Fld_Create, (const char *name, OGRFieldType type),
                      (name, type))
ARBOLEX_GDAL_FUNCTION(void, OGR_Fld_Destroy, (OGRFieldDefnH field), (field))
ARBOLEX_GDAL_FUNCTION(const char *, OGR_Fld_GetNameRef, (OGRFieldDefnH field), (field))
ARBOLEX_GDAL_FUNCTION(void, OGR_G_DestroyGeometry, (OGRGeometryH geometry), (geometry))
ARBOLEX_GDAL_FUNCTION(OGRErr, OGR_L_CreateFeature, (OGRLayerH layer, OGRFeatureH feature),
                      (layer, feature))
ARBOLEX_GDAL_FUNCTION(OGRErr, OGR_L_CreateField, (OGRLayerH layer, OGRFieldDefnH field, int approx),
                      (layer, field, approx))
ARBOLEX_GDAL_FUNCTION(GIntBig, OGR_L_GetFeatureCount, (OGRLayerH layer, int force), (layer, force))
ARBOLEX_GDAL_FUNCTION(OGRwkbGeometryType, OGR_L_GetGeomType, (OGRLayerH layer), (layer))
ARBOLEX_GDAL_FUNCTION(OGRFeatureDefnH, OGR_L_GetLayerDefn, (OGRLayerH layer), (layer))
ARBOLEX_GDAL_FUNCTION(OGRFeatureH, OGR_L_GetNextFeature, (OGRLayerH layer), (layer))
ARBOLEX_GDAL_FUNCTION(OGRSpatialReferenceH, OGR_L_GetSpatialRef, (OGRLayerH layer), (layer))
ARBOLEX_GDAL_FUNCTION(int, VSIUnlink, (const char *path), (path))
ARBOLEX_GDAL_FUNCTION(VSILFILE *, VSIFOpenL, (const char *path, const char *mode), (path, mode))
ARBOLEX_GDAL_FUNCTION(int, VSIFCloseL, (VSILFILE * file), (file))
ARBOLEX_GDAL_FUNCTION(const char *, CPLReadLineL, (VSILFILE * file), (file))
