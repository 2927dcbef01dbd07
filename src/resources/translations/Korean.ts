<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="ko_KR" sourcelanguage="en_US">
<context>
    <name>GuiStatReportingPluginUi</name>
    <message>
        <source>Form</source>
        <translation>양식</translation>
    </message>
    <message>
        <source>Open Templates Editor</source>
        <translation>템플릿 편집기 열기</translation>
    </message>
    <message>
        <source>Opens Report Template Editor</source>
        <translation>보고서 템플릿 편집기를 엽니다</translation>
    </message>
    <message>
        <source>Generate Report File</source>
        <translation>보고서 파일 만들기</translation>
    </message>
    <message>
        <source>Exports current measurments to pdf file.</source>
        <translation>현재 측정값을 PDF 파일로 내보냅니다.</translation>
    </message>
    <message>
        <source>Open Statistics Window</source>
        <translation>통계 창 열기</translation>
    </message>
    <message>
        <source>Template:</source>
        <translation>템플릿:</translation>
    </message>
    <message>
        <source>Browse Templates</source>
        <translation>템플릿 찾아보기</translation>
    </message>
    <message>
        <source>Opens default template for report generation</source>
        <translation>보고서를 만들 때 사용할 기본 템플릿을 엽니다</translation>
    </message>
</context>
<context>
    <name>KvAddImageDialog</name>
    <message>
        <source>Choose image file</source>
        <translation>이미지 파일 선택</translation>
    </message>
    <message>
        <source>Image file(*.png *.jpg *.gif *.tif *.bmp)</source>
        <translation>이미지 파일(*.png *.jpg *.gif *.tif *.bmp)</translation>
    </message>
</context>
<context>
    <name>KvAddLinkDialogUi</name>
    <message>
        <source>Insert Link</source>
        <translation>링크 삽입</translation>
    </message>
    <message>
        <source>Title:</source>
        <translation>제목:</translation>
    </message>
    <message>
        <source>URL:</source>
        <translation>URL:</translation>
    </message>
</context>
<context>
    <name>KvAlignmentOptionsRow</name>
    <message>
        <source>Align left</source>
        <translation>왼쪽 맞춤</translation>
    </message>
    <message>
        <source>Align center</source>
        <translation>가운데 맞춤</translation>
    </message>
    <message>
        <source>Align right</source>
        <translation>오른쪽 맞춤</translation>
    </message>
</context>
<context>
    <name>KvBaseEditorNodeFactory</name>
    <message>
        <source>Measurements Table</source>
        <translation>측정값 표</translation>
    </message>
    <message>
        <source>Text Document</source>
        <translation>텍스트 문서</translation>
    </message>
    <message>
        <source>Camera Image View</source>
        <translation>카메라 이미지 뷰</translation>
    </message>
    <message>
        <source>Image View</source>
        <translation>이미지 뷰</translation>
    </message>
    <message>
        <source>Statistics</source>
        <translation>통계</translation>
    </message>
    <message>
        <source>Statistics Table</source>
        <translation>통계 표</translation>
    </message>
    <message>
        <source>Counters</source>
        <translation>카운터</translation>
    </message>
    <message>
        <source>Min / Median / Max Box</source>
        <translation>상자 그림(최소/중앙값/최대)</translation>
    </message>
    <message>
        <source>Trend</source>
        <translation>추세</translation>
    </message>
</context>
<context>
    <name>KvCameraImageNodeOptionsWidget</name>
    <message>
        <source>Camera image view</source>
        <translation>카메라 이미지 뷰</translation>
    </message>
    <message>
        <source>Render measurements</source>
        <translation>측정 결과 표시</translation>
    </message>
    <message>
        <source>Draw the measurement objects on the picture</source>
        <translation>측정 개체를 이미지 위에 그립니다</translation>
    </message>
</context>
<context>
    <name>KvCameraImageWidget</name>
    <message>
        <source>Camera Image View</source>
        <translation>카메라 이미지 뷰</translation>
    </message>
</context>
<context>
    <name>KvColumnsOptionsRow</name>
    <message>
        <source>Select columns:</source>
        <translation>열 선택:</translation>
    </message>
</context>
<context>
    <name>KvEditorAddImageExtWidgetUi</name>
    <message>
        <source>Width:</source>
        <translation>너비:</translation>
    </message>
    <message>
        <source>Width in percent of the text&apos;s width</source>
        <translation>텍스트 너비에 대한 비율(%)</translation>
    </message>
    <message>
        <source>Float:</source>
        <translation>배치:</translation>
    </message>
    <message>
        <source>Side of the text at which the picture stands</source>
        <translation>텍스트를 기준으로 이미지를 놓을 쪽</translation>
    </message>
    <message>
        <source>none</source>
        <translation>없음</translation>
    </message>
    <message>
        <source>left</source>
        <translation>왼쪽</translation>
    </message>
    <message>
        <source>right</source>
        <translation>오른쪽</translation>
    </message>
</context>
<context>
    <name>KvEditorToolCombo</name>
    <message>
        <source>Group of blocks, open</source>
        <translation>블록 그룹, 펼쳐짐</translation>
    </message>
    <message>
        <source>Group of blocks, closed</source>
        <translation>블록 그룹, 접힘</translation>
    </message>
    <message>
        <source>Close the group (Enter)</source>
        <translation>그룹 접기(Enter)</translation>
    </message>
    <message>
        <source>Open the group (Enter)</source>
        <translation>그룹 펼치기(Enter)</translation>
    </message>
</context>
<context>
    <name>KvEditorToolWidget</name>
    <message>
        <source>Drag onto the page, or press Enter to append</source>
        <translation>페이지로 끌어 놓으세요. Enter 키를 누르면 끝에 추가됩니다</translation>
    </message>
</context>
<context>
    <name>KvFileDialogs</name>
    <message>
        <source>%1 already exists.
Do you want to replace it?</source>
        <translation>%1 파일이 이미 있습니다.
바꾸시겠습니까?</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>저장</translation>
    </message>
</context>
<context>
    <name>KvFooterWidget</name>
    <message>
        <source>Footer</source>
        <translation>바닥글</translation>
    </message>
</context>
<context>
    <name>KvGroupByOptionsRow</name>
    <message>
        <source>Group by:</source>
        <translation>그룹화 기준:</translation>
    </message>
    <message>
        <source>Object</source>
        <translation>개체</translation>
    </message>
    <message>
        <source>Measurement</source>
        <translation>측정 항목</translation>
    </message>
</context>
<context>
    <name>KvHeaderWidget</name>
    <message>
        <source>Header</source>
        <translation>머리글</translation>
    </message>
</context>
<context>
    <name>KvImageFile</name>
    <message>
        <source>Cannot read the image file %1</source>
        <translation>이미지 파일 %1을(를) 읽을 수 없습니다</translation>
    </message>
    <message>
        <source>The image that the template holds of %1 is damaged</source>
        <translation>템플릿에 저장된 %1 이미지가 손상되었습니다</translation>
    </message>
</context>
<context>
    <name>KvImageNodeOptionsWidget</name>
    <message>
        <source>Image view</source>
        <translation>이미지 뷰</translation>
    </message>
    <message>
        <source>Browse</source>
        <translation>찾아보기</translation>
    </message>
    <message>
        <source>Choose an image file</source>
        <translation>이미지 파일을 선택합니다</translation>
    </message>
    <message>
        <source>Choose image file</source>
        <translation>이미지 파일 선택</translation>
    </message>
    <message>
        <source>Image file(*.png *.jpg *.gif *.tif *.bmp)</source>
        <translation>이미지 파일(*.png *.jpg *.gif *.tif *.bmp)</translation>
    </message>
</context>
<context>
    <name>KvImageWidget</name>
    <message>
        <source>Image View</source>
        <translation>이미지 뷰</translation>
    </message>
</context>
<context>
    <name>KvPageCountWidget</name>
    <message>
        <source>Page count</source>
        <translation>페이지 수</translation>
    </message>
</context>
<context>
    <name>KvPrintProgressDialog</name>
    <message>
        <source>Cancel</source>
        <translation>취소</translation>
    </message>
    <message>
        <source>Printing the report</source>
        <translation>보고서 인쇄 중</translation>
    </message>
    <message>
        <source>Progress</source>
        <translation>진행률</translation>
    </message>
    <message>
        <source>Cancel (Esc)</source>
        <translation>취소(Esc)</translation>
    </message>
    <message>
        <source>Page %1 of %2</source>
        <translation>%1/%2페이지</translation>
    </message>
</context>
<context>
    <name>KvReportGlyphs</name>
    <message>
        <source>No installed font has these characters, the report leaves them out: %1</source>
        <translation>설치된 글꼴에 없는 문자이므로 보고서에서 빠집니다: %1</translation>
    </message>
    <message>
        <source>No installed font has these characters, the report leaves them out: %1 (fonts to install: %2)</source>
        <translation>설치된 글꼴에 없는 문자이므로 보고서에서 빠집니다: %1(설치할 글꼴: %2)</translation>
    </message>
</context>
<context>
    <name>KvReportKeywords</name>
    <message>
        <source>Creation date (ISO)</source>
        <translation>작성일(ISO)</translation>
    </message>
    <message>
        <source>Creation date (Text)</source>
        <translation>작성일(텍스트)</translation>
    </message>
    <message>
        <source>Creation time</source>
        <translation>작성 시각</translation>
    </message>
    <message>
        <source>Program name</source>
        <translation>프로그램 이름</translation>
    </message>
    <message>
        <source>Program version</source>
        <translation>프로그램 버전</translation>
    </message>
    <message>
        <source>Program vendor</source>
        <translation>프로그램 제공업체</translation>
    </message>
</context>
<context>
    <name>KvReportTemplatesEditor</name>
    <message>
        <source>Report template editor</source>
        <translation>보고서 템플릿 편집기</translation>
    </message>
    <message>
        <source>Report template file (*.rtp)</source>
        <translation>보고서 템플릿 파일(*.rtp)</translation>
    </message>
</context>
<context>
    <name>KvRotationOptionsRow</name>
    <message>
        <source>Rotation</source>
        <translation>회전</translation>
    </message>
    <message>
        <source>Rotation of the picture, clockwise</source>
        <translation>이미지 회전 각도(시계 방향)</translation>
    </message>
</context>
<context>
    <name>KvSelectionOverlay</name>
    <message>
        <source>Delete block</source>
        <translation>블록 삭제</translation>
    </message>
    <message>
        <source>Delete block (Del)</source>
        <translation>블록 삭제(Del)</translation>
    </message>
</context>
<context>
    <name>KvStatisticsMeasurementsTableNodeCfg</name>
    <message>
        <source>Object Name</source>
        <translation>개체 이름</translation>
    </message>
    <message>
        <source>Object Type</source>
        <translation>개체 유형</translation>
    </message>
    <message>
        <source>Value Name</source>
        <translation>값 이름</translation>
    </message>
    <message>
        <source>Value</source>
        <translation>값</translation>
    </message>
</context>
<context>
    <name>KvStatisticsMeasurementsTableOptionsWidget</name>
    <message>
        <source>Measurements table</source>
        <translation>측정값 표</translation>
    </message>
    <message>
        <source>Order by:</source>
        <translation>정렬 기준:</translation>
    </message>
    <message>
        <source>default</source>
        <translation>기본값</translation>
    </message>
    <message>
        <source>%1, ascending</source>
        <translation>%1(오름차순)</translation>
    </message>
    <message>
        <source>%1, descending</source>
        <translation>%1(내림차순)</translation>
    </message>
</context>
<context>
    <name>KvStatisticsMeasurementsTableWidget</name>
    <message>
        <source>Measurements Table</source>
        <translation>측정값 표</translation>
    </message>
</context>
<context>
    <name>KvStatisticsStatsTableNodeCfg</name>
    <message>
        <source>Min</source>
        <translation>최소</translation>
    </message>
    <message>
        <source>Max</source>
        <translation>최대</translation>
    </message>
    <message>
        <source>Average</source>
        <translation>평균</translation>
    </message>
    <message>
        <source>Sigma</source>
        <translation>시그마</translation>
    </message>
    <message>
        <source>3 Sigma</source>
        <translation>3시그마</translation>
    </message>
    <message>
        <source>6 Sigma</source>
        <translation>6시그마</translation>
    </message>
</context>
<context>
    <name>KvStatisticsStatsTableOptionsWidget</name>
    <message>
        <source>Statistics table</source>
        <translation>통계 표</translation>
    </message>
</context>
<context>
    <name>KvStatisticsStatsTableWidget</name>
    <message>
        <source>Statistics Table</source>
        <translation>통계 표</translation>
    </message>
    <message>
        <source>Object Type</source>
        <translation>개체 유형</translation>
    </message>
    <message>
        <source>Measurement Type</source>
        <translation>측정 항목</translation>
    </message>
</context>
<context>
    <name>KvStatisticsUnitConverter</name>
    <message>
        <source>deg</source>
        <translation>도</translation>
    </message>
    <message>
        <source>pcs</source>
        <translation>개</translation>
    </message>
    <message>
        <source>%</source>
        <translation>%</translation>
    </message>
</context>
<context>
    <name>KvStatisticsWindow</name>
    <message>
        <source>Measurement statistics</source>
        <translation>측정값 통계</translation>
    </message>
    <message>
        <source>Choose a statistics view on the right.</source>
        <translation>오른쪽에서 통계 뷰를 선택하세요.</translation>
    </message>
    <message>
        <source>No statistics blocks are installed.</source>
        <translation>설치된 통계 블록이 없습니다.</translation>
    </message>
</context>
<context>
    <name>KvTemplateModel</name>
    <message>
        <source>Cannot read</source>
        <translation>읽을 수 없음</translation>
    </message>
    <message>
        <source>Cannot open file %1</source>
        <translation>파일 %1을(를) 열 수 없습니다</translation>
    </message>
    <message>
        <source>Error reading file</source>
        <translation>파일 읽기 오류</translation>
    </message>
    <message>
        <source>Cannot read file %1</source>
        <translation>파일 %1을(를) 읽을 수 없습니다</translation>
    </message>
    <message>
        <source>Cannot save</source>
        <translation>저장할 수 없음</translation>
    </message>
    <message>
        <source>Cannot create file %1</source>
        <translation>파일 %1을(를) 만들 수 없습니다</translation>
    </message>
</context>
<context>
    <name>KvTemplatesEditorWindow</name>
    <message>
        <source>Open a template file</source>
        <translation>템플릿 파일을 엽니다</translation>
    </message>
    <message>
        <source>Start a new, empty template</source>
        <translation>비어 있는 새 템플릿을 시작합니다</translation>
    </message>
    <message>
        <source>Save the template to another file</source>
        <translation>템플릿을 다른 파일에 저장합니다</translation>
    </message>
    <message>
        <source>Save the template</source>
        <translation>템플릿을 저장합니다</translation>
    </message>
    <message>
        <source>Print the report to a PDF file</source>
        <translation>보고서를 PDF 파일로 인쇄합니다</translation>
    </message>
    <message>
        <source>Header on every page</source>
        <translation>모든 페이지에 머리글 넣기</translation>
    </message>
    <message>
        <source>Footer on every page</source>
        <translation>모든 페이지에 바닥글 넣기</translation>
    </message>
    <message>
        <source>Page numbers</source>
        <translation>페이지 번호</translation>
    </message>
    <message>
        <source>Report pages</source>
        <translation>보고서 페이지</translation>
    </message>
    <message>
        <source>Blocks to add</source>
        <translation>추가할 블록</translation>
    </message>
    <message>
        <source>Are you sure?</source>
        <translation>확인</translation>
    </message>
    <message>
        <source>The template is modified, do you want to save it first?</source>
        <translation>템플릿이 변경되었습니다. 먼저 저장하시겠습니까?</translation>
    </message>
    <message>
        <source>Choose file to open</source>
        <translation>열 파일 선택</translation>
    </message>
    <message>
        <source>Choose file to save</source>
        <translation>저장 위치 선택</translation>
    </message>
    <message>
        <source>Choose file to print to</source>
        <translation>인쇄 결과 파일 선택</translation>
    </message>
    <message>
        <source>Pdf file (*.pdf)</source>
        <translation>PDF 파일(*.pdf)</translation>
    </message>
    <message>
        <source>Save failed</source>
        <translation>저장 실패</translation>
    </message>
    <message>
        <source>Cannot write to file %1</source>
        <translation>파일 %1에 쓸 수 없습니다</translation>
    </message>
    <message>
        <source>[new]</source>
        <translation>[새 템플릿]</translation>
    </message>
</context>
<context>
    <name>KvTemplatesEditorWindowUi</name>
    <message>
        <source>Open File</source>
        <translation>파일 열기</translation>
    </message>
    <message>
        <source>Clear</source>
        <translation>지우기</translation>
    </message>
    <message>
        <source>Save as ...</source>
        <translation>다른 이름으로 저장...</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>저장</translation>
    </message>
    <message>
        <source>Print</source>
        <translation>인쇄</translation>
    </message>
    <message>
        <source>Add block</source>
        <translation>블록 추가</translation>
    </message>
    <message>
        <source>The template is empty. Drag a block from here onto the page.</source>
        <translation>템플릿이 비어 있습니다. 여기에서 블록을 페이지로 끌어 놓으세요.</translation>
    </message>
</context>
<context>
    <name>KvTextDocumentNodeOptionsWidget</name>
    <message>
        <source>Text</source>
        <translation>텍스트</translation>
    </message>
    <message>
        <source>Font size in points</source>
        <translation>글꼴 크기(포인트)</translation>
    </message>
    <message>
        <source>Font size</source>
        <translation>글꼴 크기</translation>
    </message>
    <message>
        <source>Text color</source>
        <translation>글자 색</translation>
    </message>
    <message>
        <source>Bold</source>
        <translation>굵게</translation>
    </message>
    <message>
        <source>Italic</source>
        <translation>기울임꼴</translation>
    </message>
    <message>
        <source>Underline</source>
        <translation>밑줄</translation>
    </message>
    <message>
        <source>Align left</source>
        <translation>왼쪽 맞춤</translation>
    </message>
    <message>
        <source>Align center</source>
        <translation>가운데 맞춤</translation>
    </message>
    <message>
        <source>Align right</source>
        <translation>오른쪽 맞춤</translation>
    </message>
    <message>
        <source>Justify</source>
        <translation>양쪽 맞춤</translation>
    </message>
    <message>
        <source>Superscript</source>
        <translation>위 첨자</translation>
    </message>
    <message>
        <source>Subscript</source>
        <translation>아래 첨자</translation>
    </message>
    <message>
        <source>Insert link</source>
        <translation>링크 삽입</translation>
    </message>
    <message>
        <source>Insert picture</source>
        <translation>이미지 삽입</translation>
    </message>
    <message>
        <source>Insert tag</source>
        <translation>태그 삽입</translation>
    </message>
    <message>
        <source>Insert a tag that the report replaces by its value</source>
        <translation>보고서에서 실제 값으로 바뀌는 태그를 삽입합니다</translation>
    </message>
</context>
<context>
    <name>KvTextDocumentNodeWidget</name>
    <message>
        <source>Text</source>
        <translation>텍스트</translation>
    </message>
</context>
<context>
    <name>KvThemeOptionsRow</name>
    <message>
        <source>Color theme:</source>
        <translation>색상 테마:</translation>
    </message>
    <message>
        <source>Dark</source>
        <translation>어둡게</translation>
    </message>
    <message>
        <source>Light</source>
        <translation>밝게</translation>
    </message>
</context>
<context>
    <name>KvWidthOptionsRow</name>
    <message>
        <source>W</source>
        <comment>short for width</comment>
        <translation>너비</translation>
    </message>
    <message>
        <source>Width in percent</source>
        <translation>너비(%)</translation>
    </message>
    <message>
        <source>Width in percent of the page&apos;s content</source>
        <translation>페이지 본문 영역에 대한 너비(%)</translation>
    </message>
</context>
<context>
    <name>KvWindowTitleBar</name>
    <message>
        <source>Close</source>
        <translation>닫기</translation>
    </message>
</context>
<context>
    <name>StatReportingPlugin</name>
    <message>
        <source>Statistics tools</source>
        <translation>보고서 및 통계</translation>
    </message>
    <message>
        <source>Select Template File</source>
        <translation>보고서 템플릿 파일 선택</translation>
    </message>
    <message>
        <source>Report Template File (*.rtp)</source>
        <translation>보고서 템플릿 파일(*.rtp)</translation>
    </message>
    <message>
        <source>No report template selected.</source>
        <translation>선택한 보고서 템플릿이 없습니다.</translation>
    </message>
</context>
</TS>
