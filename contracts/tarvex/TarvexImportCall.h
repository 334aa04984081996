#pragma once

#include <string>

/// One call of an importer on a model: the operation, "Class::Operation", and the unique id of
/// the reference whose document it imported.
struct TarvexImportCall {
    std::string operation;
    unsigned int subject = 0;

    bool operator==(TarvexImportCall const&) const = default;
};
