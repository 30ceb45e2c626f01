#pragma once
// The station list as the Parts walk it: the occupied stations, the reverse nodes and the
// point-only nodes, in the order they joined the list. The engine keeps point-only nodes in a
// smaller form (PointNode); this view shows each of them as an STNSTRUCT made when it is
// reached, which lives as long as the view and is only a picture: writing to it changes
// nothing. Stations and reverse nodes are the engine's own, good until its next run.

#include <array>
#include <cstddef>
#include <cstdint>
#include <deque>
#include <vector>

#include "platform/text/NameTable.h"
#include "reduction/ObservationModel.h"

/// The modes and units in force when a node joined the list: HMode, VMode, AngleUnit,
/// LengthUnit. A survey has few such sets; a point-only node keeps the number of its set.
using ModeSet = std::array<wchar_t, 4>;

/// A node that only carries a point's coordinates, as setCoord makes it.
struct PointNode {
    NameId Name = kNoName;
    NameId Code = kNoName;  // in the engine's table of codes
    double East = 0.0;
    double North = 0.0;
    double Height = 0.0;
    int CoordFixed = 0;
    std::uint32_t Modes = 0;  // the node's ModeSet
};

/// A place in the station list: a station or reverse node, or a point-only node, with the
/// next node of the same name.
struct NodeEntry {
    static constexpr std::uint32_t kPointOnly = 1u << 31;
    static constexpr std::uint32_t kNone = ~std::uint32_t{0};
    std::uint32_t Ref = 0;  // the index of the node, with kPointOnly for a point-only node
    std::uint32_t NextSameName = kNone;

    bool IsPointOnly() const { return (Ref & kPointOnly) != 0; }
    std::uint32_t Index() const { return Ref & ~kPointOnly; }
};

/// One node of the list, as a pointer to it.
class StationRef {
  public:
    explicit StationRef(const STNSTRUCT* node) : Node(node) {}
    const STNSTRUCT* operator->() const { return Node; }
    const STNSTRUCT& operator*() const { return *Node; }
    const STNSTRUCT* get() const { return Node; }

  private:
    const STNSTRUCT* Node;
};

class StationList {
  public:
    /// The engine's nodes, tables of names and codes, and sets of modes.
    StationList(const std::deque<STNSTRUCT>& setups, const std::vector<PointNode>& points,
                const std::vector<NodeEntry>& nodes, const nedit::NameTable& names,
                const nedit::NameTable& codes, const std::vector<ModeSet>& modes)
        : Setups(setups), Points(points), Nodes(nodes), Names(names), Codes(codes), Modes(modes) {}

    class iterator {
      public:
        iterator(const StationList& list, std::size_t at) : List(list), At(at) {}
        StationRef operator*() const { return List[At]; }
        iterator& operator++() {
            ++At;
            return *this;
        }
        bool operator!=(const iterator& other) const { return At != other.At; }

      private:
        const StationList& List;
        std::size_t At;
    };

    std::size_t size() const { return Nodes.size(); }
    bool empty() const { return Nodes.empty(); }
    StationRef operator[](std::size_t at) const;
    StationRef front() const { return (*this)[0]; }
    StationRef back() const { return (*this)[Nodes.size() - 1]; }
    iterator begin() const { return iterator(*this, 0); }
    iterator end() const { return iterator(*this, Nodes.size()); }

  private:
    const std::deque<STNSTRUCT>& Setups;
    const std::vector<PointNode>& Points;
    const std::vector<NodeEntry>& Nodes;
    const nedit::NameTable& Names;
    const nedit::NameTable& Codes;
    const std::vector<ModeSet>& Modes;
    mutable std::deque<STNSTRUCT> Pictures;  // of the point-only nodes reached
};
