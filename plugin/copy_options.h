#pragma once
// The switches of the copy utilities, behind QrCopyOptionsKit: one byte each, in this order.

namespace quire_plugin {

struct CopyOptions {
    bool copyPicture;
    bool copyMerge;
    bool copyNamedRanges;
    bool copyPrintArea;
    bool copyPrintRepeat;
    bool copyPrintFit;
    bool copyHorPageBreak;
    bool copyComments;
    bool copyFormat;
    bool copyRowHidden;
    bool copyColHidden;
};
static_assert(sizeof(CopyOptions) == 11, "one byte per switch");

// Instance data of QrCopyOptionsKit.
struct CopyOptionsData {
    CopyOptions* options;
};

}  // namespace quire_plugin
