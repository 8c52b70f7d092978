// What the releases leave allocated on purpose. The copy of a text that the tree keeps is a copy
// also when a context takes the others over. Private, C++ only.
#ifndef QVSLEFT_H
#define QVSLEFT_H

#include "qvsClientProvCtx.h"
#include "qvsClientProvWbxml.h"
#include "qvsFields.h"

namespace [[gnu::visibility("hidden")]] qvs {

// The fields that stay allocated on purpose when a record is released: none, where nothing is said.
template <class Record>
inline constexpr FieldSet<Record> kLeft = {};

// ---- The tree

// kept[tree-application-left]: these six stay allocated when the tree is gone.
template <>
inline constexpr auto kLeft<qvsWapApplication> = setOf(&qvsWapApplication::pszFrom,
                                                       &qvsWapApplication::pszXcapAuidDcs,
                                                       &qvsWapApplication::pszXcapAuidPms,
                                                       &qvsWapApplication::pszXcapAuidCdms,
                                                       &qvsWapApplication::pszXcapImeiHeader,
                                                       &qvsWapApplication::pszXcapTidHeader);
// kept[tree-vendorconfig-left]: name and value of the parameter stay allocated.
template <>
inline constexpr auto kLeft<qvsWapVendorConfig> = setOf(&qvsWapVendorConfig::pszParamName,
                                                        &qvsWapVendorConfig::pszParamValue);
// kept[tree-roaming-left]: the ROAMING record and its texts stay allocated.
template <>
inline constexpr auto kLeft<qvsWapCharacter> = setOf(&qvsWapCharacter::ptRoaming);
// kept[tree-init-left]: INIT is constant text, which no release touches.
template <>
inline constexpr auto kLeft<qvsWapNapDef> = setOf(&qvsWapNapDef::pszInit);

// ---- The context

// kept[context-application-left]: the XCAP texts and the ROAMING records stay allocated.
template <>
inline constexpr auto kLeft<qvsCtxApplication> = setOf(&qvsCtxApplication::pszXcapAuidDcs,
                                                       &qvsCtxApplication::pszXcapAuidPms,
                                                       &qvsCtxApplication::pszXcapAuidCdms,
                                                       &qvsCtxApplication::pszXcapImeiHeader,
                                                       &qvsCtxApplication::pszXcapTidHeader,
                                                       &qvsCtxApplication::ptRoaming);
// kept[context-init-left]: the copy of INIT stays allocated.
template <>
inline constexpr auto kLeft<qvsCtxNapDef> = setOf(&qvsCtxNapDef::pszInit);
// kept[context-wifi-left]: the WIFI records stay allocated when the context is gone.
// kept[context-napdef-skipped]: NAPDEF records before the one that ptNapDef was moved to stay
// allocated too.
template <>
inline constexpr auto kLeft<qvsClientProvCtx> = setOf(&qvsClientProvCtx::ptWifi);

// ---- What is released

// The rows of a table: the fields in their order but for those that are left.
template <class Row, class Record>
consteval auto inOrder()
{
    constexpr FieldSet<Record> kStay = kLeft<Record>;
    Row all[kFieldsOf<Record>];
    (void)marked<Record>(all);
    Table<Record, Row, kRowsOf<Record> - kStay.count> table;
    size_t row = 0;
    for (uint8_t field = 0; field < kRowsOf<Record>; ++field) {
        if (!kStay.has[field]) {
            table.rows[row++] = all[field];
        }
    }
    return table;
}

// The rows of a table. One that has a field twice, or lacks one that is not left on purpose, does
// not compile.
template <class Record, class Row, size_t N>
consteval Rows<Row> allOf(const Table<Record, Row, N> &table)
{
    FieldSet<Record> seen = kLeft<Record>;
    for (const Row &row : table.rows) {
        demand(row.field < kRowsOf<Record> && !seen.has[row.field]);
        seen.has[row.field] = true;
        ++seen.count;
    }
    demand(seen.count == kRowsOf<Record>);
    return table.rows;
}

} // namespace qvs

#endif
