// Forward declarations of SDK classes that headers name but do not define, of
// the scripting engine's object type, which plug-in callables are passed as,
// and the callback types through which the host makes what a plug-in registers.
#pragma once

#include <openvorla/VApiVersion.h>

struct _object;
typedef _object PyObject;

OPENVORLA_NAMESPACE_OPEN

class VAttributePatternArray;
class VAttributeSpecArray;
class VObject;
class VPxBakeEngine;
class VPxCustomEvaluator;
class VPxMaterialInformation;
class VPxTopologyEvaluator;
class VPxTransformationMatrix;
class VRenderPassDef;
class VRenderProfile;
class VStatus;
class VSyntax;

// Makes a new instance of a registered class; the host owns it.
typedef void *(*VCreatorFunction)();
// Declares a registered node type's attributes, once, before the first node.
typedef VStatus (*VInitializeFunction)();
// The flags and arguments a registered command accepts.
typedef VSyntax (*VCreateSyntaxFunction)();
// Creators of the classes whose instances the host asks for by their own base.
typedef VPxTransformationMatrix *(*VCreateXformMatrixFunction)();
typedef VPxMaterialInformation *(*VCreateMaterialInfoFunction)(VObject &materialNode);
typedef VPxBakeEngine *(*VCreateBakeEngineFunction)();
typedef VPxCustomEvaluator *(*VCustomEvaluatorCreatorFunction)();
typedef VPxTopologyEvaluator *(*VTopologyEvaluatorCreatorFunction)();

OPENVORLA_NAMESPACE_CLOSE
