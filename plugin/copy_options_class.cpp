// QrCopyOptionsKit: the switches of the copy utilities.
#include <cstddef>
#include <cstdlib>

#include "copy_options.h"
#include "glue.h"

namespace quire_plugin {

namespace {

CopyOptions* optionsOf(REALobject self) { return instanceData<CopyOptionsData>(self, copyOptionsClass())->options; }

void constructor(REALobject self) {
    if (debugging()) debugLine("CopyOptions::CopyOptions");
    auto* options = static_cast<CopyOptions*>(std::calloc(1, sizeof(CopyOptions)));
    if (!options) {
        raiseHostException("OutOfMemoryException", "Failed to allocate memory for options.");
        return;
    }
    *options = CopyOptions{true, true, true, true, true, true, true, true, true, true, true};
    instanceData<CopyOptionsData>(self, copyOptionsClass())->options = options;
}

void destructor(REALobject self) {
    auto* data = instanceData<CopyOptionsData>(self, copyOptionsClass());
    std::free(data->options);
    data->options = nullptr;
}

template <bool CopyOptions::*Field>
RBBoolean getSwitch(REALobject self, RBInteger) {
    CopyOptions* options = optionsOf(self);
    if (!requireHandle(options)) return false;
    return options->*Field ? 1 : 0;
}

template <bool CopyOptions::*Field>
void setSwitch(REALobject self, RBInteger, RBBoolean value) {
    CopyOptions* options = optionsOf(self);
    if (!requireHandle(options)) return;
    options->*Field = value != 0;
}

#define QR_SWITCH(name, field)                                                                             \
    {nullptr, name, "Boolean", kPropertyFlags, reinterpret_cast<REALproc>(&getSwitch<&CopyOptions::field>), \
     reinterpret_cast<REALproc>(&setSwitch<&CopyOptions::field>), 0, nullptr, 0, nullptr, 0, nullptr}

REALproperty properties[] = {
    QR_SWITCH("CopyPicture", copyPicture),         QR_SWITCH("CopyMerge", copyMerge),
    QR_SWITCH("CopyNamedRanges", copyNamedRanges), QR_SWITCH("CopyPrintArea", copyPrintArea),
    QR_SWITCH("CopyPrintFit", copyPrintFit),       QR_SWITCH("CopyPrintRepeat", copyPrintRepeat),
    QR_SWITCH("CopyHorPageBreak", copyHorPageBreak), QR_SWITCH("CopyComments", copyComments),
    QR_SWITCH("CopyFormat", copyFormat),           QR_SWITCH("CopyRowHidden", copyRowHidden),
    QR_SWITCH("CopyColHidden", copyColHidden),
};
#undef QR_SWITCH

}  // namespace

REALclassDefinition& copyOptionsClass() {
    static REALclassDefinition definition = {
        kCurrentREALControlVersion, "QrCopyOptionsKit", nullptr, sizeof(CopyOptionsData), 0,
        reinterpret_cast<REALproc>(&constructor), reinterpret_cast<REALproc>(&destructor),
        properties, sizeof properties / sizeof properties[0], nullptr, 0, nullptr, 0, nullptr, 0, nullptr, nullptr, 0,
        nullptr, 0, kClassFlags, nullptr, 0, nullptr, 0, nullptr, 0, nullptr, 0};
    return definition;
}

}  // namespace quire_plugin
