#include <algorithm>
#include <array>

#include "host/corvcim/explain/ExplanationWriters.h"
#include "host/corvcim/results/TextWriter.h"
#include "host/corvcim/text/InventoryText.h"
#include "host/corvcim/text/Text.h"

namespace Corvcim {
namespace {

using Tarn::Inventory::Disagreement;
using Tarn::Inventory::Tree;
using Tarn::Inventory::Unread;

constexpr std::array<std::string_view, 2> firmwareFields = {"ExternalClockSpeed", "UpgradeMethod"};

std::string fieldText(const FieldValue& value) {
  if (const auto* const number = std::get_if<unsigned int>(&value)) {
    return std::to_string(*number);
  }
  if (const auto* const text = std::get_if<std::string>(&value)) {
    return '"' + toPrintable(*text) + '"';
  }
  return numberListText(std::get<std::vector<unsigned int>>(value));
}

std::string valueText(const ExplainedProperty& property) {
  return property.value ? valueAsText(property.source->property, *property.value) : "-";
}

/// A line of the account below a property.
std::string line(std::string_view label, const std::string& text) {
  return text.empty() ? "" : "    " + padRight(std::string(label), 9) + "  " + text + '\n';
}

std::string originText(const Tarn::Inventory::Origin& origin) {
  return toPrintable(origin.source) + (origin.raw.empty() ? "" : ": " + toPrintable(origin.raw));
}

std::string inventoryText(const ExplainedProperty& property) {
  const std::string field(property.source->field);
  if (field.empty()) {
    return "";
  }
  if (!property.datum.value) {
    const bool isFirmwares =
        property.unread.empty() && std::ranges::find(firmwareFields, field) != firmwareFields.end();
    return field + " is not known" + (isFirmwares ? "; only the firmware's SMBIOS tables tell it" : "");
  }
  const bool hasRule = property.origin != nullptr && !property.origin->rule.empty();
  return field + ' ' + fieldText(*property.datum.value) +
         (hasRule ? ", by: " + toPrintable(property.origin->rule) : "");
}

std::string disagreementText(const Disagreement& entry) {
  return toPrintable(entry.chosen) + " (" + toPrintable(entry.chosenSource) + ") was taken, not " +
         toPrintable(entry.other) + " (" + toPrintable(entry.otherSource) + ')';
}

std::string unreadText(const Unread& entry) {
  return toPrintable(entry.file) + ": " + toPrintable(entry.reason) +
         (entry.remedy.empty() ? "" : "; " + toPrintable(entry.remedy));
}

std::string propertyText(const ExplainedProperty& property, std::size_t width) {
  std::string text = "  " + padRight(std::string(property.source->property), width) + "  " + valueText(property) + '\n';
  text += line("datum", property.origin == nullptr ? "" : originText(*property.origin));
  text += line("inventory", inventoryText(property));
  for (const Disagreement& entry : property.disagreements) {
    text += line("disputed", disagreementText(entry));
  }
  for (const Unread& entry : property.unread) {
    text += line("not read", unreadText(entry));
  }
  return text + line("library", property.step);
}

std::size_t widthOf(const ExplainedInstance& instance) {
  std::size_t width = 0;
  for (const ExplainedProperty& property : instance.properties) {
    width = std::max(width, property.source->property.size());
  }
  return width;
}

std::string headingOf(const Tree& tree, const ExplainedInstance& instance) {
  return std::string(tree.node(instance.node).path()) + ": " + std::string(instance.className) +
         (instance.notReported.empty() ? "" : ", not reported: " + toPrintable(instance.notReported)) + '\n';
}

/// What is about a part but about none of the properties shown, such as which parts belong together.
std::string otherDisagreements(const Tree& tree, std::span<const ExplainedInstance> instances) {
  std::string text;
  for (const Disagreement& entry : tree.disagreements()) {
    const bool isShown = std::ranges::any_of(instances, [&](const ExplainedInstance& instance) {
      return std::ranges::any_of(instance.properties, [&](const ExplainedProperty& property) {
        return std::ranges::find(property.disagreements, entry) != property.disagreements.end();
      });
    });
    const bool isAbout = std::ranges::any_of(
        instances, [&](const ExplainedInstance& instance) { return entry.path == tree.node(instance.node).path(); });
    if (isAbout && !isShown) {
      text += "  " + entry.path + ", " + toPrintable(entry.property) + ": " + disagreementText(entry) + '\n';
    }
  }
  return text.empty() ? "" : "\nOther disagreements:\n" + text;
}

std::string withNotes(std::string text, const Tree& tree, std::span<const ExplainedInstance> instances) {
  text += otherDisagreements(tree, instances);
  const std::string unread = writeUnread(tree.unread());
  return unread.empty() ? text : text + '\n' + unread;
}

/// Where a property comes from, on what is left of a line.
std::string shortSource(const ExplainedProperty& property) {
  const bool isDisputed = !property.disagreements.empty();
  const std::string note = isDisputed ? " (disputed)" : "";
  if (!property.datum.value) {
    return "not known" + note;
  }
  if (property.datum.isVirtual && !property.source->ifVirtual.empty()) {
    return "the machine is virtual" + note;
  }
  return (property.origin == nullptr ? std::string(property.source->field) : toPrintable(property.origin->source)) +
         note;
}

using ShortRow = std::array<std::string, 3>;

std::string shortText(const Tree& tree, const ExplainedInstance& instance) {
  std::vector<ShortRow> rows;
  std::array<std::size_t, 2> widths = {};
  for (const ExplainedProperty& property : instance.properties) {
    if (property.source->field.empty() || property.source->field == "path") {
      continue;
    }
    rows.push_back({std::string(property.source->property), valueText(property), shortSource(property)});
    for (std::size_t i = 0; i < widths.size(); ++i) {
      widths[i] = std::max(widths[i], columns(rows.back()[i]));
    }
  }
  std::string text = headingOf(tree, instance);
  for (const ShortRow& row : rows) {
    text += "  " + padRight(row[0], widths[0]) + "  " + padRight(row[1], widths[1]) + "  " + row[2] + '\n';
  }
  return text;
}

}  // namespace

std::string writeExplanations(const Tree& tree, std::span<const ExplainedInstance> instances) {
  std::string text;
  for (const ExplainedInstance& instance : instances) {
    text += (text.empty() ? "" : "\n") + headingOf(tree, instance);
    for (const ExplainedProperty& property : instance.properties) {
      text += propertyText(property, widthOf(instance));
    }
  }
  return withNotes(text, tree, instances);
}

std::string writeShortExplanations(const Tree& tree, std::span<const ExplainedInstance> instances) {
  std::string text;
  for (const ExplainedInstance& instance : instances) {
    text += (text.empty() ? "" : "\n") + shortText(tree, instance);
  }
  return withNotes(text, tree, instances);
}

}  // namespace Corvcim
