#pragma once

/// Who this filter is. The identifier also marks each JobItem that it makes.
namespace PluginIdentity {

constexpr int Kind = 2;
constexpr char Version[] = "1.0.0.1";
constexpr char Vendor[] = "Microsoft";
constexpr char Identifier[] = "ORV.MSOffice.1";

} // namespace PluginIdentity
