#pragma once

#include "hostlibs/DexApi.h"
#include "hostlibs/VynAlloc.h"
#include "hostlibs/VynString.h"
#include "ieObjects/IEDrawProperties.h"
#include "ieObjects/IEInterfaces.h"
#include "ieObjects/IEOwningList.h"

namespace vyn::ie {

// How a layer's objects are to be avoided (machine-control avoidance zones). The data model only
// stores and copies the value; the names describe the usual meaning and any other value may be passed
// cast from its number.
enum EDexAvoidanceMode : int {
  AVOIDANCE_NONE = 0,  // the layer's objects are not an avoidance zone
  AVOIDANCE_ZONE = 1,  // the layer's objects mark a zone to keep out of
};

// Where the avoidance value of a layer is measured from. Stored and copied only, as above.
enum EDexSurfaceAvoidanceMode : int {
  SURFACE_AVOIDANCE_NONE = 0,          // no vertical limit
  SURFACE_AVOIDANCE_BY_DEPTH = 1,      // the value is a depth below the surface
  SURFACE_AVOIDANCE_BY_ELEVATION = 2,  // the value is an elevation
};

// A layer of the job's layer table: a name and identifier, visibility and plot status, notes, the
// avoidance settings and one drawing-property object per geometry kind. The layer owns its
// property objects (setDrawProperties deletes the one it replaces unless it is the same pointer);
// copy construction and assignment duplicate them. Survey objects refer to layers without owning them.
class DEX_API DexLayer : public IDexNameInterface, public IDexIdInterface {
 public:
  VYN_CLASS_ALLOCATOR

  DexLayer() = default;
  DexLayer(const DexLayer&) = default;
  DexLayer& operator=(const DexLayer&) = default;
  ~DexLayer() override;

  // Name and identifier, stored unchanged.
  void setName(const CVynStringT<wchar_t>& name) override { name_ = name; }
  const CVynStringT<wchar_t>& getName() const override { return name_; }
  void setId(const CVynStringT<wchar_t>& id) override { id_ = id; }
  const CVynStringT<wchar_t>& getId() const override { return id_; }

  // Drawing properties. The getters answer null for a type outside 0 to 2 or when none is held; the
  // typed shortcuts also answer null when the object held for that kind is of another class.
  IDexDrawProperties* getDrawProperties(int type) { return drawProperties_.get(type); }
  const IDexDrawProperties* getDrawProperties(int type) const { return drawProperties_.get(type); }
  DexDrawPointProperties* getDrawPointProperties();
  const DexDrawPointProperties* getDrawPointProperties() const;
  DexDrawLineProperties* getDrawLineProperties();
  const DexDrawLineProperties* getDrawLineProperties() const;
  DexDrawAreaProperties* getDrawAreaProperties();
  const DexDrawAreaProperties* getDrawAreaProperties() const;
  // Takes ownership of properties (null allowed) and deletes the object held before, unless it is
  // the same pointer. Ignored for a type outside 0 to 2 and for an object the layer already holds
  // under another type; the caller then keeps properties.
  void setDrawProperties(int type, IDexDrawProperties* properties) { drawProperties_.set(type, properties); }
  // Sets the colour of each property object the layer holds; creates none.
  void setColor(unsigned long color) { drawProperties_.setColor(color); }

  // Status. Setting either status, or the notes, marks the layer as no longer at its defaults, even
  // when the value does not change.
  bool isActive() const noexcept { return active_; }
  void setActiveStatus(bool active);
  bool isPlot() const noexcept { return plot_; }
  void setPlotStatus(bool plot);
  const CVynStringT<wchar_t>& getNotes() const noexcept { return notes_; }
  void setNotes(const CVynStringT<wchar_t>& notes);

  // Avoidance: returns the avoidance mode and writes the value and the surface mode.
  EDexAvoidanceMode getAvoidance(double& value, EDexSurfaceAvoidanceMode& surfaceMode) const;
  void setAvoidance(EDexAvoidanceMode mode, EDexSurfaceAvoidanceMode surfaceMode, double value);

  // True when no status or notes were set, the avoidance mode is 0 and no property object held
  // isDefined().
  bool areAllParamsByDefault() const;

  // A new default point, line or area property object for the exact texts "Point", "Line" and
  // "Area", otherwise null. The caller owns the result.
  static IDexDrawProperties* createDrawPropertiesFromString(const CVynStringT<wchar_t>& text);

 private:
  bool active_ = true;
  bool plot_ = true;
  bool statusByDefault_ = true;
  DexDrawPropertiesByType drawProperties_;
  CVynStringT<wchar_t> notes_;
  CVynStringT<wchar_t> name_;
  CVynStringT<wchar_t> id_;
  EDexAvoidanceMode avoidanceMode_ = AVOIDANCE_NONE;
  EDexSurfaceAvoidanceMode surfaceAvoidanceMode_ = SURFACE_AVOIDANCE_NONE;
  double avoidanceValue_ = 0.0;
};

// The job's layer table: the layers in insertion order and the index of the default layer (-1 for
// none). The dictionary owns its layers and deletes them in its destructor; copy construction and
// assignment duplicate every layer with its property objects.
class DEX_API DexDrawDictionary {
 public:
  VYN_CLASS_ALLOCATOR

  DexDrawDictionary() = default;
  DexDrawDictionary(const DexDrawDictionary&) = default;
  DexDrawDictionary& operator=(const DexDrawDictionary&) = default;
  virtual ~DexDrawDictionary();

  // Appends layer and takes ownership; names are not checked, so a name may occur twice. A null
  // layer is ignored.
  void addLayer(DexLayer* layer) { layers_.add(layer); }
  int getNumberOfLayers() const noexcept { return layers_.count(); }
  // The layer at index, or null when index is outside the list.
  DexLayer* getLayerAt(int index) noexcept { return layers_.at(index); }
  const DexLayer* getLayerAt(int index) const noexcept { return layers_.at(index); }
  // The first layer whose name equals name exactly (case-sensitive), or null.
  DexLayer* findLayer(const CVynStringT<wchar_t>& name);
  const DexLayer* findLayer(const CVynStringT<wchar_t>& name) const;

  // Stores index as the default layer and returns true; false (nothing changes) for an index outside
  // 0 to getNumberOfLayers()-1.
  bool setDefaultLayer(int index);
  // The default layer, or null when none is set or the stored index is outside the list.
  DexLayer* getDefaultLayer() noexcept { return layers_.at(defaultLayerIndex_); }
  const DexLayer* getDefaultLayer() const noexcept { return layers_.at(defaultLayerIndex_); }

 private:
  DexOwningList<DexLayer> layers_;
  int defaultLayerIndex_ = -1;
};

}  // namespace vyn::ie
