// What the releases leave allocated on purpose. The copy of a text that the tree keeps is a copy
// also when a context takes the others over. Private, C++ only.
#ifndef QVSLEFT_H
#define QVSLEFT_H

#include "qvsClientProvCtx.h"
#include "qvsClientProvWbxml.h"
#include "qvsFields.h"

namespace [[gnu::visibility("hidden")]] qvs {

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

} // namespace qvs

#endif
