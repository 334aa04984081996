#pragma once

// The enumerations of the PMI objects. Plain integers, as everywhere in the library: a value
// outside the names below can still be passed, and readers must expect one.

enum TarvexPMIAnnotationType : int {
    TarvexPMI_UnknownType = 0,
    TarvexPMI_Datum = 1,
    TarvexPMI_DatumTarget = 2,
    TarvexPMI_Note = 3,
    TarvexPMI_FlagNote = 4,
    TarvexPMI_NOA = 5,
    TarvexPMI_Roughness = 6,
    TarvexPMI_GDT = 7,
    TarvexPMI_Dimension = 8,
};

enum TarvexPMIOrientation : int {
    TarvexPMI_Horizontal = 0,
    TarvexPMI_Vertical = 1,
    TarvexPMI_Parallel = 2,
    TarvexPMI_Perpendicular = 3,
    TarvexPMI_DimAngle = 4,
};

enum TarvexPMICameraType : int {
    TarvexPMI_Camera_Unknown = 0,
    TarvexPMI_Camera_Perspective = 1,
    TarvexPMI_Camera_Orthographic = 2,
};

enum TarvexPMIDatumTargetType : int {
    TarvexPMI_DTT_Unknown = 0,
    TarvexPMI_DTT_Point = 1,
    TarvexPMI_DTT_Line = 2,
    TarvexPMI_DTT_AreaCircular = 3,
    TarvexPMI_DTT_AreaRectangular = 4,
    TarvexPMI_DTT_AreaFace = 5,
    TarvexPMI_DTT_Feature = 6,
    TarvexPMI_DTT_UserDefined = 7,
};

enum TarvexPMIDimensionMainType : int {
    TarvexPMI_DMT_Unknown = 0,
    TarvexPMI_DMT_Basic = 1,
    TarvexPMI_DMT_Reference = 2,
    TarvexPMI_DMT_Tolerance = 3,
    TarvexPMI_DMT_CoordDim = 4,
};

enum TarvexPMIDimensionSubType : int {
    TarvexPMI_Distance = 0,
    TarvexPMI_DistanceOffset = 1,
    TarvexPMI_Length = 2,
    TarvexPMI_Length_OR_Distance = 3,
    TarvexPMI_LengthCurvilinear = 4,
    TarvexPMI_Angle = 5,
    TarvexPMI_Radius = 6,
    TarvexPMI_RadiusTangent = 7,
    TarvexPMI_RadiusCylinder = 8,
    TarvexPMI_RadiusEdge = 9,
    TarvexPMI_Diameter = 10,
    TarvexPMI_DiameterTangent = 11,
    TarvexPMI_DiameterCylinder = 12,
    TarvexPMI_DiameterEdge = 13,
    TarvexPMI_DiameterCone = 14,
    TarvexPMI_Chamfer = 15,
    TarvexPMI_Slope = 16,
    TarvexPMI_DimGDT = 17,
    TarvexPMI_DimDatumFeature = 18,
    TarvexPMI_DimDatumTarget = 19,
    TarvexPMI_DimBalloon = 20,
    TarvexPMI_No_Dim = 21,
    TarvexPMI_AngleArc = 22,
    TarvexPMI_LengthCircular = 23,
    TarvexPMI_Fillet = 24,
    TarvexPMI_CoordDimension_2D = 25,
    TarvexPMI_CoordDimension_3D = 26,
};

enum TarvexPMIUnit : int {
    TarvexPMI_DimUnitNone = 0,
    TarvexPMI_DimUnitMM = 1,
    TarvexPMI_DimUnitINCH = 2,
    TarvexPMI_DimUnitMETER = 3,
    TarvexPMI_DimUnitCM = 4,
    TarvexPMI_DimUnitKM = 5,
    TarvexPMI_DimUnitFOOT = 6,
    TarvexPMI_DimUnitF_I_F64 = 7,
    TarvexPMI_DimUnitF_I_F16 = 8,
    TarvexPMI_DimUnitF_I_DEC = 9,
    TarvexPMI_DimUnitDEGREE = 10,
    TarvexPMI_DimUnitMINUTE = 11,
    TarvexPMI_DimUnitSECOND = 12,
    TarvexPMI_DimUnitRADIAN = 13,
};

enum TarvexPMIArrowSymbol : int {
    TarvexPMI_NOTUSED = 0,
    TarvexPMI_CROSS = 1,
    TarvexPMI_PLUS = 2,
    TarvexPMI_CONCENTRIC = 3,
    TarvexPMI_COINCIDENT = 4,
    TarvexPMI_FULLCIRCLE = 5,
    TarvexPMI_FULLSQUARE = 6,
    TarvexPMI_STAR = 7,
    TarvexPMI_DOT = 8,
    TarvexPMI_SMALLDOT = 9,
    TarvexPMI_MISC1 = 10,
    TarvexPMI_MISC2 = 11,
    TarvexPMI_FULLCIRCLE2 = 12,
    TarvexPMI_FULLSQUARE2 = 13,
    TarvexPMI_OPEN_ARROW = 14,
    TarvexPMI_UNFILLED_ARROW = 15,
    TarvexPMI_BLANKED_ARROW = 16,
    TarvexPMI_FILLED_ARROW = 17,
    TarvexPMI_UNFILLED_CIRCLE = 18,
    TarvexPMI_BLANKED_CIRCLE = 19,
    TarvexPMI_FILLED_CIRCLE = 20,
    TarvexPMI_CROSSED_CIRCLE = 21,
    TarvexPMI_BLANKED_SQUARE = 22,
    TarvexPMI_FILLED_SQUARE = 23,
    TarvexPMI_BLANKED_TRIANGLE = 24,
    TarvexPMI_FILLED_TRIANGLE = 25,
    TarvexPMI_MANIPULATOR_SQUARE = 26,
    TarvexPMI_MANIPULATOR_DIAMOND = 27,
    TarvexPMI_MANIPULATOR_CIRCLE = 28,
    TarvexPMI_MANIPULATOR_TRIANGLE = 29,
    TarvexPMI_DOUBLE_OPEN_ARROW = 30,
    TarvexPMI_WAVE = 31,
};

enum TarvexPMIToleranceType : int {
    TarvexPMI_TOLTYPE_UNKNOWN = 0,
    TarvexPMI_Form_Straightness = 1,
    TarvexPMI_Form_Flatness = 2,
    TarvexPMI_Form_Circularity = 3,
    TarvexPMI_Form_Cylindricity = 4,
    TarvexPMI_Form_ProfileAnyLine = 5,
    TarvexPMI_Form_ProfileAnySurface = 6,
    TarvexPMI_Orientation_Parallelism = 7,
    TarvexPMI_Orientation_Perpendicularity = 8,
    TarvexPMI_Orientation_Angularity = 9,
    TarvexPMI_Location_TruePosition = 10,
    TarvexPMI_Location_Concentricity = 11,
    TarvexPMI_Location_Coaxiality = 12,
    TarvexPMI_Location_Symmetry = 13,
    TarvexPMI_Location_PositionOfAnyLine = 14,
    TarvexPMI_Location_PositionOfASurface = 15,
    TarvexPMI_RunOut_Circular = 16,
    TarvexPMI_RunOut_Total = 17,
};

enum TarvexPMIToleranceValueType : int {
    TarvexPMI_ValueType_None = 0,
    TarvexPMI_ValueType_Diameter = 1,
    TarvexPMI_ValueType_Radius = 2,
    TarvexPMI_ValueType_Spherical = 3,
    TarvexPMI_ValueType_Square = 4,
};

enum TarvexPMIToleranceModifier : int {
    TarvexPMI_NoModifier = 0,
    TarvexPMI_MaterialCondition_Unsupported = 1,
    TarvexPMI_MaterialCondition_NoModifier = 2,
    TarvexPMI_MaterialCondition_Maximum = 3,
    TarvexPMI_MaterialCondition_Least = 4,
    TarvexPMI_MaterialCondition_RegardlessOfFeatureSize = 5,
    TarvexPMI_TangentPlane_Unsupported = 6,
    TarvexPMI_TangentPlane_NotTangent = 7,
    TarvexPMI_TangentPlane_Tangent = 8,
    TarvexPMI_FreeState_Unsupported = 9,
    TarvexPMI_FreeState_Free = 10,
    TarvexPMI_FreeState_NotFree = 11,
    TarvexPMI_Statistical_Symbol = 12,
};

enum TarvexPMIFont : int {
    TarvexPMI_Simplex = 0,
    TarvexPMI_Din = 1,
    TarvexPMI_Military = 2,
    TarvexPMI_ISO = 3,
    TarvexPMI_Lightline = 4,
    TarvexPMI_Century = 5,
    TarvexPMI_IGES_1001 = 6,
    TarvexPMI_IGES_1002 = 7,
    TarvexPMI_IGES_1003 = 8,
};

enum TarvexPMIRoughnessObtentionType : int {
    TarvexPMI_RO_UnSupported = 0,
    TarvexPMI_RO_NotDefined = 1,
    TarvexPMI_RO_MachiningMandatory = 2,
    TarvexPMI_RO_MachiningForbidden = 3,
};

enum TarvexPMIRoughnessApplicabilityType : int {
    TarvexPMI_RA_UnSupported = 0,
    TarvexPMI_RA_SpecifiedSurfaceOnly = 1,
    TarvexPMI_RA_AllPartSurfaces = 2,
    TarvexPMI_RA_BasicSurface = 3,
};
