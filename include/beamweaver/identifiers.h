// Identifiers of every interface and class the library and its sibling components use.
// Each identifier is fixed once: changing one breaks every client built against it.
#pragma once

#include "platform/guid.h"

// ---- type library and application ----
inline constexpr GUID LIBID_BeamweaverLib = MakeGuid("D33D7AE2-7096-4E73-BE1D-736BB2816AA2");
inline constexpr GUID APPID_Beamweaver = MakeGuid("745A6523-60C5-4CA7-A018-DBAECF67D6D3");

// ---- interfaces ----
inline constexpr IID IID_IPatternPointList = MakeGuid("9F9EAC1B-670C-4F14-9407-A20E71F65D4E");
inline constexpr IID IID_ISubPatternCollection = MakeGuid("4AE65366-2F39-4FEF-A56B-20C152376D82");
inline constexpr IID IID_IPatternPointListCount = MakeGuid("724D11C3-E05A-41F3-AFBB-D9678A038A3B");
inline constexpr IID IID_IPatternLine = MakeGuid("D2CF94CA-EE65-4C72-85FA-049AB72EBCB9");
inline constexpr IID IID_IPatternSpot = MakeGuid("391DC939-E025-46ED-AF5D-2B4DD8A8F79B");
inline constexpr IID IID_IPatternCircle = MakeGuid("67EFA225-8E93-49A1-9A00-C54BA4AD3199");
inline constexpr IID IID_IPatternPolygon = MakeGuid("D18D1BFA-C4BB-4E1E-8709-CF39A1F44292");
inline constexpr IID IID_IPatternRegularCrossSection = MakeGuid("9D01F8BA-5E41-4905-8C16-8520A18A4521");
inline constexpr IID IID_IPatternMultiPassCrossSection = MakeGuid("CDAE6C5B-D7DC-463E-AFB4-FD5E6F8E8DDC");
inline constexpr IID IID_IBeamweaverCollection = MakeGuid("D82E7B4D-5DE3-4920-94DE-A68A4821F4B8");
inline constexpr IID IID_ICoordinateFloat = MakeGuid("2AB32C23-B71A-4E76-B84A-2929B573E16F");
inline constexpr IID IID_IRectangleFloat = MakeGuid("073BB467-C2B2-462C-BBF5-BC710977EB92");
inline constexpr IID IID_IRectangleInt = MakeGuid("5DD217C2-7390-47C4-96A8-0E64F264FA18");
inline constexpr IID IID_IRangeInt = MakeGuid("F3C2CFF7-CFDE-4842-9A19-DED460E2BAC5");
inline constexpr IID IID_ISize2DInt = MakeGuid("0C0C290F-E05C-49D1-BF0C-FDB2C033BAA6");
inline constexpr IID IID_ITransformationMatrix2D = MakeGuid("F22AC100-3BF7-42E0-A12D-E0D937D370E2");
inline constexpr IID IID_IPatternPointBuffer = MakeGuid("DDC012F8-A786-4584-856D-044BC1F49414");
inline constexpr IID IID_ISubPattern = MakeGuid("DE2BA9C8-CF2E-41DF-8B64-441C516B64AE");
inline constexpr IID IID_IScanDefinition = MakeGuid("BC322BD5-6359-47D4-9926-363FE6A11024");
inline constexpr IID IID_IPatternScanDefinition = MakeGuid("A222643E-744A-46F8-85FE-02883EC5C2E3");
inline constexpr IID IID_IRasterScanDefinition = MakeGuid("775D096D-0F0F-45FA-8EE1-4C1FD194910B");
inline constexpr IID IID_ISizeInt = MakeGuid("DBFD22D6-5229-407D-A407-E15D7FF35253");
inline constexpr IID IID_IPattern = MakeGuid("BA04A117-26C3-4C87-A3BA-F3D7A1D8C4FE");
inline constexpr IID IID_IPatternShape = MakeGuid("F78A830F-E6D0-4F70-BC4D-B29B6713961F");
inline constexpr IID IID_ICloneablePattern = MakeGuid("C97816B5-B7B9-415A-AC71-7A40FBD66481");
inline constexpr IID IID_IExclusionAwarePattern = MakeGuid("AFCE6DFE-B614-4EA5-95E0-957E81F276F3");
inline constexpr IID IID_IPatternValidationResult = MakeGuid("3406B7AE-3459-46E5-A5EB-2FC44F6E57A5");
inline constexpr IID IID_IPatternShapeVisitor = MakeGuid("1374D0DA-2A4B-4B2D-98BE-0863FA625685");
inline constexpr IID IID_IScanAlignments = MakeGuid("637BE33B-22B9-40D0-8491-3985B14E93E7");
inline constexpr IID IID_IPatternAlignments = MakeGuid("8686CA22-5A76-41B1-A743-2D65AC9BFD2B");
inline constexpr IID IID_IRasterAlignments = MakeGuid("05EC9F85-FCC0-4749-BB13-17A0006A6BD3");
inline constexpr IID IID_IScanRenderingProperties = MakeGuid("F8052FE1-3AD4-4072-A3FB-D5EFBB5E0E52");
inline constexpr IID IID_IPatternRenderingProperties = MakeGuid("96D46A1C-FAA6-45B3-BEA4-E7D52F751AFF");
inline constexpr IID IID_IRasterRenderingProperties = MakeGuid("838CCE57-83F5-4C1D-ACB1-CF774477FB74");
inline constexpr IID IID_IPatternPointFilter = MakeGuid("8B3237B9-C071-457D-8366-DF32E30B4EA9");
inline constexpr IID IID_IExclusionZone = MakeGuid("B63AAD80-4B5E-414B-9A35-1B62324C9000");
inline constexpr IID IID_IShape = MakeGuid("862E31D0-A517-438D-BC7D-AC26BCACAFD3");
inline constexpr IID IID_IShapeRectangle = MakeGuid("32462F6F-1291-4962-B31C-958FAA854BEA");
inline constexpr IID IID_IShapeCircle = MakeGuid("D25BE255-8C23-4338-917B-45DE7A0DA46D");
inline constexpr IID IID_IShapePolygon = MakeGuid("BE91003E-E6EE-41BC-9718-01C4C64E2C90");
inline constexpr IID IID_IExcludablePatternShape = MakeGuid("6DF9F3B1-1E3E-468E-A7AE-7205B0F20D66");
inline constexpr IID IID_IScanStrategy = MakeGuid("66A1C76B-78CF-413A-8C4B-A42A1AA7B7C6");
inline constexpr IID IID_IScanStrategyRaster = MakeGuid("2C7990C7-BBFA-4FA3-A122-1B8E710450AA");
inline constexpr IID IID_IScanStrategyRectangular = MakeGuid("26C6110D-07C5-4D6F-960B-6B4004FA4DAF");
inline constexpr IID IID_IScanStrategyCircular = MakeGuid("C01F23DB-0DC1-46BC-86A9-F32891D11B82");
inline constexpr IID IID_IPatternRectangle = MakeGuid("1EB77AD4-3322-4D45-8683-64F8CC882D52");
inline constexpr IID IID_IPatternFactory = MakeGuid("77E6F76A-E3A2-4733-9371-BCAC794585B4");
inline constexpr IID IID_IPatternFactory2 = MakeGuid("BA1DD1B0-1D59-4A8B-9B36-68F5198953C9");
inline constexpr IID IID_IBeamweaver = MakeGuid("EE8B404A-E213-49ED-AF52-80D40E7189BE");
inline constexpr IID IID_IPatternSpotList = MakeGuid("0D2FD7BD-AABC-48E7-A445-0615D0AC293B");
inline constexpr IID IID_IPatternSpotList2 = MakeGuid("98BDBEC0-1B17-4E1D-924D-EC7BE82C1447");
inline constexpr IID IID_IPatternSpotListItem = MakeGuid("71521484-71E5-41D2-825B-21B323A6532F");
inline constexpr IID IID_IPatternStreamFile = MakeGuid("3A3ADDD1-F456-4A58-82F0-BE00A173DBF3");
inline constexpr IID IID_IPatternBitmapFile = MakeGuid("D0E38E66-3DB7-4294-A9D5-9CF1244A0FC9");
inline constexpr IID IID_IPatternRawMillPoints = MakeGuid("566CBDD4-9E76-4A25-8098-2FDA63D0A8E6");
inline constexpr IID IID_IRasterScan = MakeGuid("2F2BE103-F656-48E3-9C7A-49C47D17617A");
inline constexpr IID IID_IEelsRaster = MakeGuid("8BDF5082-5FCD-4E50-BD5B-EEF87E5974B7");
inline constexpr IID IID_ISqtRaster = MakeGuid("7554CA7B-36EA-47E2-8272-420131E9432C");
inline constexpr IID IID_IPatternStep = MakeGuid("C8781615-CBBB-4FEF-9AA4-38716232027C");
inline constexpr IID IID_IPatternWobble = MakeGuid("6C8AE573-8E8F-4D75-AD08-63F9B0A61752");
inline constexpr IID IID_IWobbleAxis = MakeGuid("FA32C90B-8460-490C-9E04-F1A13D03508F");
inline constexpr IID IID_IRawImage2 = MakeGuid("BD1B1872-96CD-49C3-8129-A4E0C3A8B187");

// ---- classes of the library ----
inline constexpr CLSID CLSID_RasterScan = MakeGuid("973903FB-E845-4247-9D90-3AF196487761");
inline constexpr CLSID CLSID_RasterAlignments = MakeGuid("57679904-94B0-4FD1-B0E5-00B2435DD311");
inline constexpr CLSID CLSID_PatternAlignments = MakeGuid("A20F3C54-D5D6-4DCA-B381-CF75D0A00454");
inline constexpr CLSID CLSID_RasterRenderingProperties = MakeGuid("1FE26E28-D19D-4F92-B30A-2137458871F7");
inline constexpr CLSID CLSID_PatternRenderingProperties = MakeGuid("D7A83222-D832-4CDB-8363-A67314BACE46");
inline constexpr CLSID CLSID_PatternRectangle = MakeGuid("3B2086B5-D40F-441A-85A0-280D077101B5");
inline constexpr CLSID CLSID_PatternCircle = MakeGuid("A083CAE5-029C-4DE7-9B90-50CE0E0111B6");
inline constexpr CLSID CLSID_PatternLine = MakeGuid("D62B8AB1-6877-4F6D-B8CD-EECEA2E937E1");
inline constexpr CLSID CLSID_PatternSpot = MakeGuid("8BD86EA6-0567-4974-9395-3B56A1C2C80F");
inline constexpr CLSID CLSID_PatternSpotList = MakeGuid("ED9518F1-113F-426E-9332-AFD1D099489A");
inline constexpr CLSID CLSID_BeamweaverElement = MakeGuid("CDD4F1CC-B454-4565-99A9-1EDD4381AF88");
inline constexpr CLSID CLSID_BeamweaverCollection = MakeGuid("E478086B-DE18-410D-955D-8254CDB89C01");
inline constexpr CLSID CLSID_PatternStreamFile = MakeGuid("CB758BC0-6E80-49FF-A7C5-A954931180F7");
inline constexpr CLSID CLSID_PatternBitmapFile = MakeGuid("197A59C8-9123-4487-B66B-14B0F28B9C70");
inline constexpr CLSID CLSID_PatternRawMillPoints = MakeGuid("A5789639-4172-4E18-84F3-8F983CBEBA6F");
inline constexpr CLSID CLSID_PatternFactory = MakeGuid("DF3954D5-9097-413A-96B2-60C216341EEC");
inline constexpr CLSID CLSID_PatternPolygon = MakeGuid("7A172EEB-39A5-49E3-BA54-06EF17DA89D1");
inline constexpr CLSID CLSID_PatternRegularCrossSection = MakeGuid("B11D0090-20E3-4901-97D7-60CBD41E8E2E");
inline constexpr CLSID CLSID_PatternMultiPassCrossSection = MakeGuid("22E5C37E-AF0D-4E25-9D8E-85B045160BF6");
inline constexpr CLSID CLSID_ScanStrategyRaster = MakeGuid("A37F3C46-19A4-4FBF-8854-E5D54DB0115F");
inline constexpr CLSID CLSID_ScanStrategyRectangular = MakeGuid("243176AE-20A7-473E-B8C9-8AA9BB6247BE");
inline constexpr CLSID CLSID_ScanStrategyCircular = MakeGuid("3FAB3B41-CF9B-4DD7-99DE-63F8A6912D5B");
inline constexpr CLSID CLSID_ExclusionZone = MakeGuid("341477F8-A4D0-4325-894D-291AE057E1F5");
inline constexpr CLSID CLSID_ShapeRectangle = MakeGuid("180CE309-0637-4AEF-B685-E814BEB5E8E8");
inline constexpr CLSID CLSID_ShapeCircle = MakeGuid("33A2919B-6F8C-4ED0-9E82-839511F23740");
inline constexpr CLSID CLSID_ShapePolygon = MakeGuid("35A76D37-4BD4-4BDC-B106-5828260F39EE");
inline constexpr CLSID CLSID_EelsRaster = MakeGuid("B2256610-DFE9-4B54-8DA2-9769ACCD9A48");
inline constexpr CLSID CLSID_PatternStep = MakeGuid("E2AC8C9F-F45D-4151-94E5-8233289B43C0");
inline constexpr CLSID CLSID_PatternWobble = MakeGuid("7513D66C-8170-4ED6-AF89-507AA65A7A1E");
inline constexpr CLSID CLSID_SqtRaster = MakeGuid("2DE0C463-B297-4C6B-9BDD-75B6AEB769C8");
inline constexpr CLSID CLSID_PatternSpotListItem = MakeGuid("2CA9A6C3-59D8-4E06-B7F2-D1A431DFBC14");
inline constexpr CLSID CLSID_PatternSpotList2 = MakeGuid("31DA05D3-6DCE-4B2E-B6D8-85E99E75482C");

// ---- classes of the sibling components (point lists, geometry values, image reader) ----
inline constexpr CLSID CLSID_PatternPointList = MakeGuid("AC23AB1E-E972-41AD-A528-E5C05A6E8873");
inline constexpr CLSID CLSID_SubPatternCollection = MakeGuid("7ABC72D2-6A3F-40A3-BF1D-AE03907BFD7E");
inline constexpr CLSID CLSID_CoordinateFloat = MakeGuid("40DD0D08-DAF0-40ED-9F3D-3A5E84823F7F");
inline constexpr CLSID CLSID_RectangleFloat = MakeGuid("7C501DC9-328E-4F3B-AAC8-543D91709D67");
inline constexpr CLSID CLSID_RectangleInt = MakeGuid("A6F675B0-803F-40AE-A4E3-60D89F92B5DF");
inline constexpr CLSID CLSID_RangeInt = MakeGuid("96DE4772-75A0-4A11-AF23-3A04A2DEA03D");
inline constexpr CLSID CLSID_Size2DInt = MakeGuid("CF088B0B-1867-4C53-8DAF-6BA0268CDFBC");
inline constexpr CLSID CLSID_TransformationMatrix2D = MakeGuid("A2C05F96-E0DC-4C77-B819-56FD1AF851BB");
inline constexpr CLSID CLSID_ImageReader = MakeGuid("FE4F5263-11D5-4724-95BA-A978983B6369");
