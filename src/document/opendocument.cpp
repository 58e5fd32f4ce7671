#include "document/opendocument.hpp"

#include "document/documentmessages.hpp"
#include "document/documentreader.hpp"
#include "shell/vbformat.hpp"
#include "work/standwork.hpp"
#include "workflow/iworkwindows.hpp"

#include <QFileInfo>

namespace arbolex::document {

bool openDocumentInto(const QString &path, workflow::IMainCommands &main, QString &fault) {
    QString reason;
    const std::optional<Document> document = readDocumentFile(path, reason);
    if (!document) {
        fault = text::openFault(QFileInfo(path).fileName(), reason);
        return false;
    }
    main.restore(*document);
    return true;
}

Document documentForStand(const work::StandWork &work, const rotation::Stand &stand,
                          const work::SubCompartment &id, int targetAge, int step, double netArea) {
    Document d = work.snapshot();
    d.identification = id;
    d.modelId = stand.model;
    d.rows.clear();
    d.currentRow = 0;
    d.selectionEnd = 0;
    d.standingVolume = 0.0;
    d.felled = false;
    d.cashFlow.clear();
    d.siteIndex = 0.0f;
    d.siteIndexText.clear();
    // A new sub-compartment: the data folder's costs, as the estate counts them.
    d.establishmentCost = work.defaultEstablishmentCost();
    d.annualCost = work.defaultAnnualCost();
    // The fields as SetGrowFrom writes them.
    d.fields = {shell::formatNumber(stand.age, u"##0"),
                shell::formatNumber(stand.stocking, u"#####0"),
                shell::formatNumber(stand.height, u"##0.0"),
                shell::formatNumber(stand.basalArea, u"##0.00"),
                QString(),
                shell::formatNumber(targetAge, u"##0"),
                shell::formatNumber(step, u"##0"),
                netArea > 0.0 ? shell::generalNumber(netArea) : QString()};
    return d;
}

} // namespace arbolex::document
