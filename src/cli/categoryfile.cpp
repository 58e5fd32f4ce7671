#include "cli/categoryfile.hpp"

#include "cli/options.hpp"
#include "prices/pricedata.hpp"
#include "shell/seqfile.hpp"

namespace arbolex::cli {

std::vector<NamedCategory> readCategoryFile(const QString &path) {
    shell::SequentialReader in(path);
    if (in.openError().number != 0) {
        throw UsageError{QStringLiteral("cannot read the category file \"%1\": %2")
                             .arg(path, in.openError().description)};
    }
    std::vector<NamedCategory> categories;
    for (int i = 0; i < prices::kUserCategoryCount; ++i) {
        NamedCategory c;
        for (const shell::RuntimeError &e :
             {in.readString(c.name), in.readNumber(c.bounds.smallEnd),
              in.readNumber(c.bounds.bigEnd)}) {
            if (e.number != 0) {
                throw UsageError{QStringLiteral("category %1 of \"%2\": %3")
                                     .arg(QString::number(i + 1), path, e.description)};
            }
        }
        if (c.bounds.smallEnd != 0.0f) {
            categories.push_back(c);
        }
    }
    return categories;
}

} // namespace arbolex::cli
