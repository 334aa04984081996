#include "contracts/tarvex/TarvexPartDocument.h"

#include "contracts/tarvex/TarvexModelData.h"

TarvexWString TarvexPartDocument::GetName() const {
    if (!m_data) {
        return TarvexWString();
    }
    m_data->faults.Check("TarvexPartDocument::GetName", 0);
    TarvexAuthoredReference const* const reference = m_data->FindReference(m_referenceId);
    return reference == nullptr ? TarvexWString() : TarvexWString(reference->name);
}
