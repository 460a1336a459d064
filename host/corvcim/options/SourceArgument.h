#ifndef HOST_CORVCIM_OPTIONS_SOURCEARGUMENT_H
#define HOST_CORVCIM_OPTIONS_SOURCEARGUMENT_H

#include <string>
#include <string_view>

#include "platform/inventory/tree/Tree.h"

namespace Corvcim {

/// Sources as people name them on the command line. Besides what the library takes (Source.h) there are
///
///     FILE, DIRECTORY   without a kind in front: the kind is seen from the first bytes
///     -                 standard input, alone or as the FILE of a kind
///     hwloc:FILE, hwloc-synthetic:DESCRIPTION   converted (HwlocSource.h)
inline constexpr std::string_view sourceArgumentForms =
    "live, root:DIRECTORY, snapshot:FILE, json:FILE, smbios:FILE, hwloc:FILE, the name of a file, or - for standard "
    "input";

/// Whether the text is one of these. A file that is named without its kind must be there.
bool isSourceArgument(std::string_view text);

/// The same source in a form that the library reads, in any process and as often as it likes: what can be read only
/// once (standard input, a pipe) and what is converted is kept in memory for this process and its children. A text that
/// is no source stays as it is. Throws InventoryError if the source cannot be read or its kind cannot be seen.
std::string settleSource(std::string_view text);

/// The inventory of a description that hwloc reads, as the option --from names it. Throws InventoryError.
Tarn::Inventory::Tree convertDescription(std::string_view description);

/// The text of a message, with the names of what is kept in memory replaced by those that the user gave.
std::string withGivenNames(std::string text);

}  // namespace Corvcim

#endif
