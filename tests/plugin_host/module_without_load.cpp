// A library module exporting every flat entry point but qrBookLoadW: the entry points come from
// the component libraries linked in whole, the export list leaves that one out.
