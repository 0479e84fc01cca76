#pragma once

#include "hostlibs/DexApi.h"
#include "hostlibs/VynString.h"
#include "hostlibs/VynTime.h"
#include "ieObjects/IEObjectsType.h"

// The small abstract interfaces that the objects of the data model are assembled from. None holds
// data; construction, copy and assignment do nothing. They carry no class allocator of their own: a
// class that combines several of them declares VYN_CLASS_ALLOCATOR itself, so that `new` is never
// ambiguous.
namespace vyn::ie {

// An object with a name. Names are stored and returned unchanged (no trimming, no validation).
class DEX_API IDexNameInterface {
 public:
  IDexNameInterface() = default;
  IDexNameInterface(const IDexNameInterface&) = default;
  IDexNameInterface& operator=(const IDexNameInterface&) = default;
  virtual ~IDexNameInterface();

  virtual void setName(const CVynStringT<wchar_t>& name) = 0;
  virtual const CVynStringT<wchar_t>& getName() const = 0;
};

// An object with an identifier, stored and returned unchanged.
class DEX_API IDexIdInterface {
 public:
  IDexIdInterface() = default;
  IDexIdInterface(const IDexIdInterface&) = default;
  IDexIdInterface& operator=(const IDexIdInterface&) = default;
  virtual ~IDexIdInterface();

  virtual void setId(const CVynStringT<wchar_t>& id) = 0;
  virtual const CVynStringT<wchar_t>& getId() const = 0;
};

// An object with an edit state. The library gives the states no meaning beyond these: new survey
// objects and new total-station sights start ACTIVE_STATE; an arc or circle that a non-uniform scale
// would distort becomes INACTIVE_STATE; ANY_STATE is only a query argument ("every state") of the
// dataset's counting queries. Hosts and plug-ins may use the states as they like.
class DEX_API IDexStateInterface {
 public:
  enum ECurrentState : int {
    INACTIVE_STATE = 0,
    ACTIVE_STATE = 1,
    ANY_STATE = 2,
  };

  IDexStateInterface() = default;
  IDexStateInterface(const IDexStateInterface&) = default;
  IDexStateInterface& operator=(const IDexStateInterface&) = default;
  virtual ~IDexStateInterface();

  virtual void setStateType(ECurrentState state) = 0;
  virtual ECurrentState getStateType() const = 0;
};

// An object with a time stamp (raw observations, job-history records).
class DEX_API IDexTimeInterface {
 public:
  IDexTimeInterface() = default;
  IDexTimeInterface(const IDexTimeInterface&) = default;
  IDexTimeInterface& operator=(const IDexTimeInterface&) = default;
  virtual ~IDexTimeInterface();

  virtual void setTime(const base::CTime& time) = 0;
  virtual const base::CTime& getTime() const = 0;
};

// An object of a dataset that tells its kind. getType() is not const: that is its signature in the
// plug-in interface.
class DEX_API IDexObjInterface {
 public:
  IDexObjInterface() = default;
  IDexObjInterface(const IDexObjInterface&) = default;
  IDexObjInterface& operator=(const IDexObjInterface&) = default;
  virtual ~IDexObjInterface();

  virtual EDexObjectsType getType() = 0;
};

}  // namespace vyn::ie
