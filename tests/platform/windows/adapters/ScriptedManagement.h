#pragma once

#include "platform/windows/adapters/ComValues.h"

#include <wbemcli.h>

#include <map>
#include <string>
#include <vector>

// Operations of the system's objects that nobody asks for here.
#define QUENDRA_NOT_ASKED(name, ...)                                                                         \
  HRESULT STDMETHODCALLTYPE name(__VA_ARGS__) override { return E_NOTIMPL; }

/// The system's managed objects as a test scripts them: a class of network cards with two methods.
namespace quendra::platform::windows {

/// An object with a count of its holders, and of all of its like.
template <typename Interface> class Counted : public Interface {
 public:
  explicit Counted(int& living) : living_(living) { ++living_; }
  virtual ~Counted() { --living_; }
  HRESULT STDMETHODCALLTYPE QueryInterface(REFIID, void**) override { return E_NOINTERFACE; }
  ULONG STDMETHODCALLTYPE AddRef() override { return ++holders_; }
  ULONG STDMETHODCALLTYPE Release() override {
    const ULONG left = --holders_;
    if (left == 0) delete this;
    return left;
  }

 protected:
  int& living_;

 private:
  ULONG holders_ = 1;
};

struct ScriptedMachine {
  struct Card {
    std::uint32_t index = 0;
    Text description{};
  };
  std::vector<Card> cards{};
  HRESULT query = S_OK;
  HRESULT method = S_OK;
  std::uint32_t result = 0;

  /// What was run, as in "EnableStatic of card 3: IPAddress 10.0.0.1 10.0.0.2, SubnetMask 255.0.0.0".
  std::vector<std::string> calls{};
  std::vector<std::string> queries{};
  int objects = 0; ///< that somebody holds
};

class ScriptedObject : public Counted<IWbemClassObject> {
 public:
  ScriptedObject(ScriptedMachine& machine, const ComRuntime& com)
      : Counted(machine.objects), machine_(machine), com_(com) {}

  std::map<Text, Text> texts{};
  std::map<Text, std::uint32_t> numbers{};
  std::string put{};

  HRESULT STDMETHODCALLTYPE Get(LPCWSTR name, LONG, VARIANT* value, CIMTYPE*, LONG*) override;
  HRESULT STDMETHODCALLTYPE Put(LPCWSTR name, LONG, VARIANT* value, CIMTYPE) override;
  HRESULT STDMETHODCALLTYPE SpawnInstance(LONG, IWbemClassObject** made) override;
  HRESULT STDMETHODCALLTYPE GetMethod(LPCWSTR, LONG, IWbemClassObject** in, IWbemClassObject**) override;

  QUENDRA_NOT_ASKED(GetQualifierSet, IWbemQualifierSet**)
  QUENDRA_NOT_ASKED(Delete, LPCWSTR)
  QUENDRA_NOT_ASKED(GetNames, LPCWSTR, LONG, VARIANT*, SAFEARRAY**)
  QUENDRA_NOT_ASKED(BeginEnumeration, LONG)
  QUENDRA_NOT_ASKED(Next, LONG, BSTR*, VARIANT*, CIMTYPE*, LONG*)
  QUENDRA_NOT_ASKED(EndEnumeration)
  QUENDRA_NOT_ASKED(GetPropertyQualifierSet, LPCWSTR, IWbemQualifierSet**)
  QUENDRA_NOT_ASKED(Clone, IWbemClassObject**)
  QUENDRA_NOT_ASKED(GetObjectText, LONG, BSTR*)
  QUENDRA_NOT_ASKED(SpawnDerivedClass, LONG, IWbemClassObject**)
  QUENDRA_NOT_ASKED(CompareTo, LONG, IWbemClassObject*)
  QUENDRA_NOT_ASKED(GetPropertyOrigin, LPCWSTR, BSTR*)
  QUENDRA_NOT_ASKED(InheritsFrom, LPCWSTR)
  QUENDRA_NOT_ASKED(PutMethod, LPCWSTR, LONG, IWbemClassObject*, IWbemClassObject*)
  QUENDRA_NOT_ASKED(DeleteMethod, LPCWSTR)
  QUENDRA_NOT_ASKED(BeginMethodEnumeration, LONG)
  QUENDRA_NOT_ASKED(NextMethod, LONG, BSTR*, IWbemClassObject**, IWbemClassObject**)
  QUENDRA_NOT_ASKED(EndMethodEnumeration)
  QUENDRA_NOT_ASKED(GetMethodQualifierSet, LPCWSTR, IWbemQualifierSet**)
  QUENDRA_NOT_ASKED(GetMethodOrigin, LPCWSTR, BSTR*)

 private:
  ScriptedMachine& machine_;
  const ComRuntime& com_;
};

class ScriptedAnswer : public Counted<IEnumWbemClassObject> {
 public:
  ScriptedAnswer(ScriptedMachine& machine, const ComRuntime& com)
      : Counted(machine.objects), machine_(machine), com_(com) {}

  HRESULT STDMETHODCALLTYPE Next(LONG, ULONG, IWbemClassObject** object, ULONG* count) override;

  QUENDRA_NOT_ASKED(Reset)
  QUENDRA_NOT_ASKED(NextAsync, ULONG, IWbemObjectSink*)
  QUENDRA_NOT_ASKED(Clone, IEnumWbemClassObject**)
  QUENDRA_NOT_ASKED(Skip, LONG, ULONG)

 private:
  ScriptedMachine& machine_;
  const ComRuntime& com_;
  std::size_t next_ = 0;
};

class ScriptedServices : public Counted<IWbemServices> {
 public:
  ScriptedServices(ScriptedMachine& machine, const ComRuntime& com)
      : Counted(machine.objects), machine_(machine), com_(com) {}

  HRESULT STDMETHODCALLTYPE GetObject(const BSTR path, LONG, IWbemContext*, IWbemClassObject** object,
                                      IWbemCallResult**) override;
  HRESULT STDMETHODCALLTYPE ExecQuery(const BSTR language, const BSTR query, LONG, IWbemContext*,
                                      IEnumWbemClassObject** answer) override;
  HRESULT STDMETHODCALLTYPE ExecMethod(const BSTR path, const BSTR method, LONG, IWbemContext*,
                                       IWbemClassObject* in, IWbemClassObject** out,
                                       IWbemCallResult**) override;

  QUENDRA_NOT_ASKED(OpenNamespace, const BSTR, LONG, IWbemContext*, IWbemServices**, IWbemCallResult**)
  QUENDRA_NOT_ASKED(CancelAsyncCall, IWbemObjectSink*)
  QUENDRA_NOT_ASKED(QueryObjectSink, LONG, IWbemObjectSink**)
  QUENDRA_NOT_ASKED(GetObjectAsync, const BSTR, LONG, IWbemContext*, IWbemObjectSink*)
  QUENDRA_NOT_ASKED(PutClass, IWbemClassObject*, LONG, IWbemContext*, IWbemCallResult**)
  QUENDRA_NOT_ASKED(PutClassAsync, IWbemClassObject*, LONG, IWbemContext*, IWbemObjectSink*)
  QUENDRA_NOT_ASKED(DeleteClass, const BSTR, LONG, IWbemContext*, IWbemCallResult**)
  QUENDRA_NOT_ASKED(DeleteClassAsync, const BSTR, LONG, IWbemContext*, IWbemObjectSink*)
  QUENDRA_NOT_ASKED(CreateClassEnum, const BSTR, LONG, IWbemContext*, IEnumWbemClassObject**)
  QUENDRA_NOT_ASKED(CreateClassEnumAsync, const BSTR, LONG, IWbemContext*, IWbemObjectSink*)
  QUENDRA_NOT_ASKED(PutInstance, IWbemClassObject*, LONG, IWbemContext*, IWbemCallResult**)
  QUENDRA_NOT_ASKED(PutInstanceAsync, IWbemClassObject*, LONG, IWbemContext*, IWbemObjectSink*)
  QUENDRA_NOT_ASKED(DeleteInstance, const BSTR, LONG, IWbemContext*, IWbemCallResult**)
  QUENDRA_NOT_ASKED(DeleteInstanceAsync, const BSTR, LONG, IWbemContext*, IWbemObjectSink*)
  QUENDRA_NOT_ASKED(CreateInstanceEnum, const BSTR, LONG, IWbemContext*, IEnumWbemClassObject**)
  QUENDRA_NOT_ASKED(CreateInstanceEnumAsync, const BSTR, LONG, IWbemContext*, IWbemObjectSink*)
  QUENDRA_NOT_ASKED(ExecQueryAsync, const BSTR, const BSTR, LONG, IWbemContext*, IWbemObjectSink*)
  QUENDRA_NOT_ASKED(ExecNotificationQuery, const BSTR, const BSTR, LONG, IWbemContext*,
                    IEnumWbemClassObject**)
  QUENDRA_NOT_ASKED(ExecNotificationQueryAsync, const BSTR, const BSTR, LONG, IWbemContext*, IWbemObjectSink*)
  QUENDRA_NOT_ASKED(ExecMethodAsync, const BSTR, const BSTR, LONG, IWbemContext*, IWbemClassObject*,
                    IWbemObjectSink*)

 private:
  ScriptedMachine& machine_;
  const ComRuntime& com_;
};

} // namespace quendra::platform::windows
