// The reader of sub-compartment documents (.arbolex). Beyond not crashing: a
// text that reads must write out and read back to the same document.
#include "document/documentreader.hpp"
#include "document/documentwriter.hpp"

#include <QByteArray>

#include <cstddef>
#include <cstdint>

using namespace arbolex;

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size) {
    const QByteArray json =
        QByteArray::fromRawData(reinterpret_cast<const char *>(data), static_cast<qsizetype>(size));
    QString reason;
    const auto first = document::documentFromJson(json, reason);
    if (!first) {
        if (reason.isEmpty()) {
            qFatal("a refused document gave no reason");
        }
        return 0;
    }
    const auto again = document::documentFromJson(document::documentToJson(*first), reason);
    if (!again || !again->sameWork(*first) || again->currentRow != first->currentRow ||
        again->selectionEnd != first->selectionEnd) {
        qFatal("a document read does not write out and read back the same");
    }
    return 0;
}
