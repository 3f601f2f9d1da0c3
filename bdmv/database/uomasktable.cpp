#include "database/uomasktable.h"

#include "kevro/kevro_osa.h"

namespace bdmv
{

const int UOMaskTable::UO_MASK_TABLE_SIZE;

bool UOMaskTable::IsSet(bd::UserOperationMaskDef operation) const
{
    const bd::Int32 bit = operation;
    if (bit < 0 || bit >= 8 * UO_MASK_TABLE_SIZE) {
        return false;
    }
    return ((GetUOMaskTable() >> bit) & 1) != 0;
}

void UOMaskTable::Init(const bd::UInt8* field)
{
    m_UOMaskTable = 0;
    if (field == nullptr) {
        Assert("field != nullptr", __FILE__, __LINE__);
        return;
    }
    for (int byte = 0; byte < UO_MASK_TABLE_SIZE; ++byte) {
        m_UOMaskTable = (m_UOMaskTable << 8) | field[byte];
    }
}

} // namespace bdmv
