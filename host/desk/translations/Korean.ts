<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="ko_KR" sourcelanguage="en_US">
<context>
    <name>KvDeskActions</name>
    <message>
        <source>&amp;New session</source>
        <translation>새 세션(&amp;N)</translation>
    </message>
    <message>
        <source>Start an empty session</source>
        <translation>빈 세션 시작</translation>
    </message>
    <message>
        <source>Open &amp;image...</source>
        <translation>이미지 열기(&amp;I)...</translation>
    </message>
    <message>
        <source>Open image</source>
        <translation>이미지 열기</translation>
    </message>
    <message>
        <source>&amp;Open session...</source>
        <translation>세션 열기(&amp;O)...</translation>
    </message>
    <message>
        <source>Open session</source>
        <translation>세션 열기</translation>
    </message>
    <message>
        <source>Import &amp;table...</source>
        <translation>표 가져오기(&amp;T)...</translation>
    </message>
    <message>
        <source>Import table of measured values</source>
        <translation>측정값 표 가져오기</translation>
    </message>
    <message>
        <source>&amp;Save session</source>
        <translation>세션 저장(&amp;S)</translation>
    </message>
    <message>
        <source>Save session</source>
        <translation>세션 저장</translation>
    </message>
    <message>
        <source>Save session &amp;as...</source>
        <translation>다른 이름으로 세션 저장(&amp;A)...</translation>
    </message>
    <message>
        <source>Save session to another file</source>
        <translation>세션을 다른 파일에 저장</translation>
    </message>
    <message>
        <source>&amp;Quit</source>
        <translation>끝내기(&amp;Q)</translation>
    </message>
    <message>
        <source>Quit the program</source>
        <translation>프로그램 끝내기</translation>
    </message>
    <message>
        <source>Zoom &amp;in</source>
        <translation>확대(&amp;I)</translation>
    </message>
    <message>
        <source>Zoom in</source>
        <translation>확대</translation>
    </message>
    <message>
        <source>Zoom &amp;out</source>
        <translation>축소(&amp;O)</translation>
    </message>
    <message>
        <source>Zoom out</source>
        <translation>축소</translation>
    </message>
    <message>
        <source>&amp;Fit to window</source>
        <translation>창에 맞춤(&amp;F)</translation>
    </message>
    <message>
        <source>Show the whole image</source>
        <translation>이미지 전체 표시</translation>
    </message>
    <message>
        <source>&amp;Actual size</source>
        <translation>실제 크기(&amp;A)</translation>
    </message>
    <message>
        <source>Show the image at 100 %</source>
        <translation>이미지를 100%로 표시</translation>
    </message>
    <message>
        <source>&amp;Measured values</source>
        <translation>측정값(&amp;M)</translation>
    </message>
    <message>
        <source>Show or hide the measured values</source>
        <translation>측정값 표시/숨기기</translation>
    </message>
    <message>
        <source>Stat&amp;us log</source>
        <translation>상태 로그(&amp;U)</translation>
    </message>
    <message>
        <source>Show or hide the status log</source>
        <translation>상태 로그 표시/숨기기</translation>
    </message>
    <message>
        <source>&amp;Dark or light theme</source>
        <translation>어두운/밝은 테마(&amp;D)</translation>
    </message>
    <message>
        <source>Change between the dark and the light theme</source>
        <translation>어두운 테마와 밝은 테마 전환</translation>
    </message>
    <message>
        <source>Settin&amp;gs...</source>
        <translation>설정(&amp;G)...</translation>
    </message>
    <message>
        <source>Settings</source>
        <translation>설정</translation>
    </message>
    <message>
        <source>&amp;About Measuring Desk</source>
        <translation>Measuring Desk 정보(&amp;A)</translation>
    </message>
    <message>
        <source>About Measuring Desk</source>
        <translation>Measuring Desk 정보</translation>
    </message>
    <message>
        <source>%1 (%2)</source>
        <comment>command (shortcut)</comment>
        <translation>%1(%2)</translation>
    </message>
    <message>
        <source>&amp;Export measured values...</source>
        <translation>측정값 내보내기(&amp;E)...</translation>
    </message>
    <message>
        <source>Export measured values as a table</source>
        <translation>측정값을 표로 내보내기</translation>
    </message>
    <message>
        <source>&amp;Undo</source>
        <translation>실행 취소(&amp;U)</translation>
    </message>
    <message>
        <source>Undo the last step</source>
        <translation>마지막 작업 실행 취소</translation>
    </message>
    <message>
        <source>&amp;Redo</source>
        <translation>다시 실행(&amp;R)</translation>
    </message>
    <message>
        <source>Redo what was undone</source>
        <translation>취소한 작업 다시 실행</translation>
    </message>
    <message>
        <source>Cu&amp;t</source>
        <translation>잘라내기(&amp;T)</translation>
    </message>
    <message>
        <source>Cut the selected objects</source>
        <translation>선택한 개체 잘라내기</translation>
    </message>
    <message>
        <source>&amp;Copy</source>
        <translation>복사(&amp;C)</translation>
    </message>
    <message>
        <source>Copy the selected objects</source>
        <translation>선택한 개체 복사</translation>
    </message>
    <message>
        <source>&amp;Paste</source>
        <translation>붙여넣기(&amp;P)</translation>
    </message>
    <message>
        <source>Paste copied objects</source>
        <translation>복사한 개체 붙여넣기</translation>
    </message>
    <message>
        <source>&amp;Delete</source>
        <translation>삭제(&amp;D)</translation>
    </message>
    <message>
        <source>Delete the selected objects</source>
        <translation>선택한 개체 삭제</translation>
    </message>
    <message>
        <source>Select &amp;all</source>
        <translation>모두 선택(&amp;A)</translation>
    </message>
    <message>
        <source>Select all objects on the image</source>
        <translation>이미지의 모든 개체 선택</translation>
    </message>
    <message>
        <source>Re&amp;name</source>
        <translation>이름 바꾸기(&amp;N)</translation>
    </message>
    <message>
        <source>Give the selected object a name</source>
        <translation>선택한 개체의 이름 지정</translation>
    </message>
    <message>
        <source>&amp;Find measured values</source>
        <translation>측정값 찾기(&amp;F)</translation>
    </message>
    <message>
        <source>Filter the measured values</source>
        <translation>측정값 필터링</translation>
    </message>
    <message>
        <source>&amp;Select</source>
        <translation>선택(&amp;S)</translation>
    </message>
    <message>
        <source>Select and change objects</source>
        <translation>개체 선택 및 변경</translation>
    </message>
    <message>
        <source>&amp;Line</source>
        <translation>직선(&amp;L)</translation>
    </message>
    <message>
        <source>Measure a length</source>
        <translation>길이 측정</translation>
    </message>
    <message>
        <source>&amp;Polyline</source>
        <translation>폴리라인(&amp;P)</translation>
    </message>
    <message>
        <source>Measure the length of a way</source>
        <translation>경로의 길이 측정</translation>
    </message>
    <message>
        <source>Parallel &amp;distance</source>
        <translation>평행 거리(&amp;D)</translation>
    </message>
    <message>
        <source>Measure the distance of a point from a line</source>
        <translation>점과 직선 사이의 거리 측정</translation>
    </message>
    <message>
        <source>&amp;Arc</source>
        <translation>원호(&amp;A)</translation>
    </message>
    <message>
        <source>Measure an arc through three points</source>
        <translation>세 점을 지나는 원호 측정</translation>
    </message>
    <message>
        <source>&amp;Circle</source>
        <translation>원(&amp;C)</translation>
    </message>
    <message>
        <source>Measure a circle</source>
        <translation>원 측정</translation>
    </message>
    <message>
        <source>&amp;Rectangle</source>
        <translation>직사각형(&amp;R)</translation>
    </message>
    <message>
        <source>Measure a rectangle</source>
        <translation>직사각형 측정</translation>
    </message>
    <message>
        <source>Poly&amp;gon</source>
        <translation>다각형(&amp;G)</translation>
    </message>
    <message>
        <source>Measure the area of a polygon</source>
        <translation>다각형의 면적 측정</translation>
    </message>
    <message>
        <source>Cou&amp;nter</source>
        <translation>카운터(&amp;N)</translation>
    </message>
    <message>
        <source>Count by clicks</source>
        <translation>클릭하여 개수 세기</translation>
    </message>
    <message>
        <source>&amp;Text note</source>
        <translation>텍스트 주석(&amp;T)</translation>
    </message>
    <message>
        <source>Write on the image</source>
        <translation>이미지에 글자 쓰기</translation>
    </message>
    <message>
        <source>Scale &amp;bar</source>
        <translation>스케일 바(&amp;B)</translation>
    </message>
    <message>
        <source>Draw a scale bar</source>
        <translation>스케일 바 그리기</translation>
    </message>
    <message>
        <source>Cal&amp;ibration...</source>
        <translation>교정(&amp;I)...</translation>
    </message>
    <message>
        <source>Say how large a pixel of the image is</source>
        <translation>이미지의 픽셀 하나의 크기 지정</translation>
    </message>
    <message>
        <source>Use the file&apos;s pixel size</source>
        <translation>파일의 픽셀 크기 사용</translation>
    </message>
    <message>
        <source>Measure with the pixel size that the image&apos;s file states</source>
        <translation>이미지 파일에 기록된 픽셀 크기로 측정</translation>
    </message>
    <message>
        <source>&amp;Take snapshot</source>
        <translation>스냅샷 찍기(&amp;T)</translation>
    </message>
    <message>
        <source>Save the image to the gallery</source>
        <translation>이미지를 갤러리에 저장</translation>
    </message>
    <message>
        <source>Snapshots &amp;with measurements</source>
        <translation>측정 결과 포함 스냅샷(&amp;W)</translation>
    </message>
    <message>
        <source>Draw the measured objects on snapshots</source>
        <translation>측정 개체를 스냅샷에 그리기</translation>
    </message>
    <message>
        <source>&amp;Freeze</source>
        <translation>화면 정지(&amp;F)</translation>
    </message>
    <message>
        <source>Freeze the live image</source>
        <translation>라이브 이미지 정지</translation>
    </message>
    <message>
        <source>&amp;Labels on the image</source>
        <translation>이미지의 레이블(&amp;L)</translation>
    </message>
    <message>
        <source>Show or hide the labels of objects</source>
        <translation>개체 레이블 표시/숨기기</translation>
    </message>
    <message>
        <source>&amp;Rulers</source>
        <translation>눈금자(&amp;R)</translation>
    </message>
    <message>
        <source>Show or hide the rulers</source>
        <translation>눈금자 표시/숨기기</translation>
    </message>
    <message>
        <source>&amp;Scale bar on the image</source>
        <translation>이미지의 스케일 바(&amp;S)</translation>
    </message>
    <message>
        <source>Show or hide the scale bar, on reports, too</source>
        <translation>스케일 바 표시/숨기기(보고서에도 적용)</translation>
    </message>
    <message>
        <source>&amp;Gallery</source>
        <translation>갤러리(&amp;G)</translation>
    </message>
    <message>
        <source>Show or hide the gallery</source>
        <translation>갤러리 표시/숨기기</translation>
    </message>
    <message>
        <source>&amp;Start page</source>
        <translation>시작 페이지(&amp;S)</translation>
    </message>
    <message>
        <source>Show the first steps, the examples and the recent sessions</source>
        <translation>첫 단계, 예제, 최근 세션 표시</translation>
    </message>
    <message>
        <source>&amp;User guide</source>
        <translation>사용자 가이드(&amp;U)</translation>
    </message>
    <message>
        <source>Read the user guide</source>
        <translation>사용자 가이드 보기</translation>
    </message>
</context>
<context>
    <name>KvDeskAutosave</name>
    <message>
        <source>the folder &quot;%1&quot; cannot be written</source>
        <translation>“%1” 폴더에 쓸 수 없음</translation>
    </message>
    <message>
        <source>Unsaved changes are not being copied: %1</source>
        <translation>저장되지 않은 변경 내용을 백업할 수 없음: %1</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrationCommands</name>
    <message>
        <source>The session measures with it already</source>
        <translation>세션에서 이미 이 픽셀 크기로 측정하고 있습니다</translation>
    </message>
    <message>
        <source>The image&apos;s file does not state one</source>
        <translation>이미지 파일에 픽셀 크기가 기록되어 있지 않습니다</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrationDialog</name>
    <message>
        <source>Calibration</source>
        <translation>교정</translation>
    </message>
    <message>
        <source>Objective</source>
        <translation>대물렌즈</translation>
    </message>
    <message>
        <source>Choose an objective, or type the name of a new one</source>
        <translation>대물렌즈를 선택하거나 새 대물렌즈의 이름을 입력합니다</translation>
    </message>
    <message>
        <source>Such as 10x</source>
        <translation>예: 10x</translation>
    </message>
    <message>
        <source>In use</source>
        <translation>사용 중</translation>
    </message>
    <message>
        <source>New calibration</source>
        <translation>새 교정</translation>
    </message>
    <message>
        <source>Known distance</source>
        <translation>기준 거리</translation>
    </message>
    <message>
        <source>Image file</source>
        <translation>이미지 파일</translation>
    </message>
    <message>
        <source>Typed</source>
        <translation>직접 입력</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>이름</translation>
    </message>
    <message>
        <source>Who</source>
        <translation>담당자</translation>
    </message>
    <message>
        <source>Note</source>
        <translation>비고</translation>
    </message>
    <message>
        <source>Calibrate</source>
        <translation>교정</translation>
    </message>
    <message>
        <source>History of the objective</source>
        <translation>대물렌즈 이력</translation>
    </message>
    <message>
        <source>Calibrations of this objective appear here</source>
        <translation>이 대물렌즈의 교정이 여기에 표시됩니다</translation>
    </message>
    <message>
        <source>Use again</source>
        <translation>다시 사용</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>닫기</translation>
    </message>
    <message>
        <source>New pixel size: %1</source>
        <translation>새 픽셀 크기: %1</translation>
    </message>
    <message>
        <source>No pixel size yet</source>
        <translation>픽셀 크기 없음</translation>
    </message>
    <message>
        <source>Measure with this pixel size and remember it</source>
        <translation>이 픽셀 크기로 측정하고 이력에 저장합니다</translation>
    </message>
    <message>
        <source>Complete the fields above first</source>
        <translation>먼저 위 항목을 모두 입력하세요</translation>
    </message>
    <message>
        <source>Measure with the selected calibration</source>
        <translation>선택한 교정으로 측정합니다</translation>
    </message>
    <message>
        <source>Select a calibration in the table first</source>
        <translation>먼저 표에서 교정을 선택하세요</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrationHistory</name>
    <message>
        <source>Date</source>
        <translation>날짜</translation>
    </message>
    <message>
        <source>Who</source>
        <translation>담당자</translation>
    </message>
    <message>
        <source>Pixel size</source>
        <translation>픽셀 크기</translation>
    </message>
    <message>
        <source>Origin</source>
        <translation>출처</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>이름</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrationText</name>
    <message>
        <source>%1 μm</source>
        <comment>size of a pixel</comment>
        <translation>%1 μm</translation>
    </message>
    <message>
        <source>%1 × %2 μm</source>
        <comment>width and height of a pixel</comment>
        <translation>%1 × %2 μm</translation>
    </message>
    <message>
        <source>Known distance</source>
        <translation>기준 거리</translation>
    </message>
    <message>
        <source>Image file</source>
        <translation>이미지 파일</translation>
    </message>
    <message>
        <source>Typed</source>
        <translation>직접 입력</translation>
    </message>
    <message>
        <source>Not calibrated</source>
        <translation>교정 안 됨</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrationWay</name>
    <message>
        <source>Type a number such as 5.3 or 5,3</source>
        <translation>5.3 또는 5,3과 같은 숫자를 입력하세요</translation>
    </message>
    <message>
        <source>A pixel measures between %1 and %2</source>
        <translation>픽셀 크기는 %1에서 %2 사이입니다</translation>
    </message>
</context>
<context>
    <name>KvDeskCalibrator</name>
    <message>
        <source>%1 states pixels of %2; the session measures with %3</source>
        <translation>%1에 기록된 픽셀 크기는 %2이지만 세션은 %3 기준으로 측정합니다</translation>
    </message>
    <message>
        <source>%1 states pixels of %2; the session measures in pixels</source>
        <translation>%1에 기록된 픽셀 크기는 %2이지만 세션은 픽셀 단위로 측정합니다</translation>
    </message>
    <message>
        <source>Calibrated: %1, %2 per pixel</source>
        <extracomment>%1 is an objective or a file, %2 the size of a pixel with its unit</extracomment>
        <translation>교정됨: %1, 픽셀당 %2</translation>
    </message>
</context>
<context>
    <name>KvDeskCommandLine</name>
    <message>
        <source>There is no theme &quot;%1&quot;: use %2</source>
        <translation>“%1” 테마는 없습니다. %2을(를) 사용하세요</translation>
    </message>
    <message>
        <source> or </source>
        <translation> 또는 </translation>
    </message>
    <message>
        <source>Usage: measuringdesk [OPTION...] [SESSION|IMAGE|TABLE|FOLDER|VIDEO...]
Measures objects on images and shows their values.

  --session FILE      open a session
  --image FILE        open an image
  --table FILE        import a table of measured values
  --theme Dark|Light  theme of this run
  --plugins DIR       look for plug-ins here, too; can be given several times
  --help              show this text
  --version           show the version

The environment variable STATREPORT_PLUGINS names more folders with plug-ins.
</source>
        <translation>사용법: measuringdesk [OPTION...] [SESSION|IMAGE|TABLE|FOLDER|VIDEO...]
이미지에서 개체를 측정하고 그 값을 표시합니다.

  --session FILE      세션 열기
  --image FILE        이미지 열기
  --table FILE        측정값 표 가져오기
  --theme Dark|Light  이번 실행의 테마
  --plugins DIR       이 폴더에서도 플러그인 찾기(여러 번 지정 가능)
  --help              이 도움말 표시
  --version           버전 표시

환경 변수 STATREPORT_PLUGINS로 플러그인 폴더를 더 지정할 수 있습니다.
</translation>
    </message>
    <message>
        <source>%1 (measuringdesk --help tells more)</source>
        <translation>%1 (자세한 내용: measuringdesk --help)</translation>
    </message>
</context>
<context>
    <name>KvDeskCounterBar</name>
    <message>
        <source>Clicks count for</source>
        <translation>클릭 집계 대상</translation>
    </message>
    <message>
        <source>The counter that gets the clicks (1 to 9)</source>
        <translation>클릭을 세는 카운터(키 1~9)</translation>
    </message>
    <message>
        <source>Count another class</source>
        <translation>다른 클래스 세기</translation>
    </message>
    <message>
        <source>A right click takes a place away</source>
        <translation>오른쪽 클릭으로 계수점 삭제</translation>
    </message>
    <message>
        <source>A new counter</source>
        <translation>새 카운터</translation>
    </message>
</context>
<context>
    <name>KvDeskEditCommands</name>
    <message>
        <source>&amp;Undo %1</source>
        <extracomment>%1 is what is undone or redone, such as &quot;move of Line 3&quot;</extracomment>
        <translation>실행 취소(&amp;U): %1</translation>
    </message>
    <message>
        <source>&amp;Undo</source>
        <translation>실행 취소(&amp;U)</translation>
    </message>
    <message>
        <source>&amp;Redo %1</source>
        <translation>다시 실행(&amp;R): %1</translation>
    </message>
    <message>
        <source>&amp;Redo</source>
        <translation>다시 실행(&amp;R)</translation>
    </message>
    <message>
        <source>Nothing was done yet</source>
        <translation>실행 취소할 작업이 없습니다</translation>
    </message>
    <message>
        <source>Nothing was undone</source>
        <translation>다시 실행할 작업이 없습니다</translation>
    </message>
    <message>
        <source>Select an object first</source>
        <translation>먼저 개체를 선택하세요</translation>
    </message>
    <message>
        <source>Select one object first</source>
        <translation>먼저 개체를 하나만 선택하세요</translation>
    </message>
    <message>
        <source>No measured objects were copied</source>
        <translation>복사한 측정 개체가 없습니다</translation>
    </message>
    <message>
        <source>Finish or cancel what you have begun first</source>
        <translation>시작한 작업을 먼저 마치거나 취소하세요</translation>
    </message>
</context>
<context>
    <name>KvDeskExamples</name>
    <message>
        <source>Coin: first length</source>
        <translation>동전: 첫 측정</translation>
    </message>
    <message>
        <source>Plate: dimensions</source>
        <translation>금속판: 치수</translation>
    </message>
    <message>
        <source>Cells: counting</source>
        <translation>세포: 개수 세기</translation>
    </message>
    <message>
        <source>Fibres: statistics</source>
        <translation>섬유: 통계</translation>
    </message>
</context>
<context>
    <name>KvDeskExportCommand</name>
    <message>
        <source>Nothing was measured yet</source>
        <translation>아직 측정한 것이 없습니다</translation>
    </message>
    <message>
        <source>Measured values</source>
        <comment>file name</comment>
        <translation>측정값</translation>
    </message>
    <message>
        <source>JSON files</source>
        <translation>JSON 파일</translation>
    </message>
    <message>
        <source>CSV tables</source>
        <translation>CSV 표</translation>
    </message>
    <message>
        <source>Export measured values</source>
        <translation>측정값 내보내기</translation>
    </message>
    <message>
        <source>Export cancelled: %1</source>
        <translation>내보내기 취소됨: %1</translation>
    </message>
    <message>
        <source>The table &quot;%1&quot; was not written.</source>
        <translation>“%1” 표를 쓰지 못했습니다.</translation>
    </message>
    <message>
        <source>Measured values exported: %1</source>
        <translation>측정값을 내보냄: %1</translation>
    </message>
    <message>
        <source>Exporting measured values</source>
        <translation>측정값 내보내는 중</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>취소</translation>
    </message>
</context>
<context>
    <name>KvDeskExportDialog</name>
    <message>
        <source>Export measured values</source>
        <translation>측정값 내보내기</translation>
    </message>
    <message>
        <source>Table</source>
        <translation>표</translation>
    </message>
    <message>
        <source>Numbers</source>
        <translation>숫자</translation>
    </message>
    <message>
        <source>Byte order mark, for spreadsheets that do not expect UTF-8</source>
        <translation>BOM 추가(UTF-8을 기본으로 하지 않는 스프레드시트용)</translation>
    </message>
    <message>
        <source>Apostrophe before names that spreadsheets take for formulas</source>
        <translation>스프레드시트에서 수식으로 인식하는 이름 앞에 아포스트로피 추가</translation>
    </message>
    <message>
        <source>Changes names that begin with =, +, - or @: they are others when the table is imported again</source>
        <translation>=, +, -, @로 시작하는 이름을 바꿉니다. 표를 다시 가져오면 다른 이름이 됩니다</translation>
    </message>
    <message>
        <source>Export...</source>
        <translation>내보내기...</translation>
    </message>
    <message>
        <source>CSV, one row per value</source>
        <translation>CSV, 값마다 한 행</translation>
    </message>
    <message>
        <source>CSV, one row per object</source>
        <translation>CSV, 개체마다 한 행</translation>
    </message>
    <message>
        <source>JSON</source>
        <translation>JSON</translation>
    </message>
    <message>
        <source>1.5, commas between the fields</source>
        <translation>1.5, 필드 구분은 쉼표</translation>
    </message>
    <message>
        <source>1,5, semicolons between the fields (spreadsheets, %1)</source>
        <extracomment>%1 is the name of a language</extracomment>
        <translation>1,5, 필드 구분은 세미콜론(스프레드시트, %1)</translation>
    </message>
    <message>
        <source>1.5, commas between the fields (spreadsheets, %1)</source>
        <translation>1.5, 필드 구분은 쉼표(스프레드시트, %1)</translation>
    </message>
    <message>
        <source>For statistics programs. Can be imported here again.</source>
        <translation>통계 프로그램용입니다. 여기로 다시 가져올 수 있습니다.</translation>
    </message>
    <message>
        <source>For spreadsheets. Headings name the units.</source>
        <translation>스프레드시트용입니다. 열 머리글에 단위가 표시됩니다.</translation>
    </message>
    <message>
        <source>For programs. Numbers always have a decimal point.</source>
        <translation>프로그램용입니다. 소수점은 항상 마침표입니다.</translation>
    </message>
    <message>
        <source>No measured object is selected</source>
        <translation>선택한 측정 개체가 없습니다</translation>
    </message>
    <message>
        <source>Concerns CSV tables only</source>
        <translation>CSV 표에만 적용됩니다</translation>
    </message>
    <message numerus="yes">
        <source>Only the selected object(s) (%n)</source>
        <translation>
            <numerusform>선택한 개체만(%n개)</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>KvDeskExposureControl</name>
    <message>
        <source>E&amp;xposure</source>
        <translation>노출(&amp;X)</translation>
    </message>
    <message>
        <source>Exposure time of the camera</source>
        <translation>카메라의 노출 시간</translation>
    </message>
    <message>
        <source> ms</source>
        <comment>milliseconds</comment>
        <translation> ms</translation>
    </message>
</context>
<context>
    <name>KvDeskFileCommands</name>
    <message>
        <source>Sessions</source>
        <translation>세션</translation>
    </message>
    <message>
        <source>All files</source>
        <translation>모든 파일</translation>
    </message>
    <message>
        <source>Unsaved changes</source>
        <translation>저장되지 않은 변경 내용</translation>
    </message>
    <message>
        <source>Save the changes to &quot;%1&quot;?</source>
        <translation>“%1”의 변경 내용을 저장하시겠습니까?</translation>
    </message>
    <message>
        <source>The session &quot;%1&quot; was not opened.</source>
        <translation>“%1” 세션을 열지 못했습니다.</translation>
    </message>
    <message>
        <source>Image missing</source>
        <translation>이미지 없음</translation>
    </message>
    <message>
        <source>Open the session without its image?</source>
        <translation>이미지 없이 세션을 여시겠습니까?</translation>
    </message>
    <message>
        <source>The image &quot;%1&quot; was not opened.</source>
        <translation>“%1” 이미지를 열지 못했습니다.</translation>
    </message>
    <message>
        <source>Image opened: %1</source>
        <translation>이미지 열림: %1</translation>
    </message>
    <message>
        <source>The table &quot;%1&quot; was not imported.</source>
        <translation>“%1” 표를 가져오지 못했습니다.</translation>
    </message>
    <message>
        <source>%1: %2</source>
        <comment>file, remark</comment>
        <translation>%1: %2</translation>
    </message>
    <message>
        <source>The session &quot;%1&quot; was not saved.</source>
        <translation>“%1” 세션을 저장하지 못했습니다.</translation>
    </message>
    <message>
        <source>Session saved: %1</source>
        <translation>세션 저장됨: %1</translation>
    </message>
    <message>
        <source>Open session</source>
        <translation>세션 열기</translation>
    </message>
    <message>
        <source>Open image</source>
        <translation>이미지 열기</translation>
    </message>
    <message>
        <source>Images</source>
        <translation>이미지</translation>
    </message>
    <message>
        <source>Import table</source>
        <translation>표 가져오기</translation>
    </message>
    <message>
        <source>Tables</source>
        <translation>표</translation>
    </message>
    <message>
        <source>Save session</source>
        <translation>세션 저장</translation>
    </message>
    <message>
        <source>Measuring Desk</source>
        <translation>Measuring Desk</translation>
    </message>
    <message>
        <source>Only one session can be open; not opened: %1</source>
        <translation>세션은 하나만 열 수 있습니다. 열지 않은 파일: %1</translation>
    </message>
    <message>
        <source>Neither a session, an image nor a table: %1</source>
        <translation>세션, 이미지, 표가 모두 아님: %1</translation>
    </message>
    <message>
        <source>There is not enough memory</source>
        <translation>메모리가 부족합니다</translation>
    </message>
    <message>
        <source>Opening &quot;%1&quot;</source>
        <translation>“%1” 여는 중</translation>
    </message>
    <message>
        <source>The measurements were not restored.</source>
        <translation>측정 데이터를 복원하지 못했습니다.</translation>
    </message>
    <message>
        <source>Restoring measurements</source>
        <translation>측정 데이터 복원 중</translation>
    </message>
    <message>
        <source>Importing &quot;%1&quot;</source>
        <translation>“%1” 가져오는 중</translation>
    </message>
    <message>
        <source>Saving &quot;%1&quot;</source>
        <translation>“%1” 저장 중</translation>
    </message>
    <message>
        <source>Session changed by another program</source>
        <translation>다른 프로그램이 세션을 변경함</translation>
    </message>
    <message>
        <source>&quot;%1&quot; was changed by another program. Overwrite its changes?</source>
        <translation>다른 프로그램이 “%1” 세션을 변경했습니다. 그 변경 내용을 덮어쓰시겠습니까?</translation>
    </message>
    <message>
        <source>Overwrite</source>
        <translation>덮어쓰기</translation>
    </message>
    <message>
        <source>Save as...</source>
        <translation>다른 이름으로 저장...</translation>
    </message>
    <message numerus="yes">
        <source>%n files were not opened.</source>
        <extracomment>%n is 2 at least</extracomment>
        <translation>
            <numerusform>파일 %n개를 열지 못했습니다.</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Session opened: %1 (%n object(s))</source>
        <translation>
            <numerusform>세션 열림: %1(개체 %n개)</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Measurements restored: %1 (%n object(s))</source>
        <translation>
            <numerusform>측정 데이터 복원됨: %1(개체 %n개)</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Table imported: %1 (%n object(s))</source>
        <translation>
            <numerusform>표 가져옴: %1(개체 %n개)</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>KvDeskFilePixelSize</name>
    <message>
        <source>%1 states pixels of %2.</source>
        <comment>file, size</comment>
        <translation>%1에 기록된 픽셀 크기는 %2입니다.</translation>
    </message>
    <message>
        <source>The image&apos;s file does not state how large its pixels are.</source>
        <translation>이미지 파일에 픽셀 크기가 기록되어 있지 않습니다.</translation>
    </message>
</context>
<context>
    <name>KvDeskGallery</name>
    <message>
        <source>Gallery</source>
        <translation>갤러리</translation>
    </message>
    <message>
        <source>Hide the gallery</source>
        <translation>갤러리 숨기기</translation>
    </message>
    <message>
        <source>&amp;Open image</source>
        <translation>이미지 열기(&amp;O)</translation>
    </message>
    <message>
        <source>&amp;Show in folder</source>
        <translation>폴더에서 보기(&amp;S)</translation>
    </message>
    <message>
        <source>&amp;Copy path</source>
        <translation>경로 복사(&amp;C)</translation>
    </message>
    <message>
        <source>&amp;Move to trash...</source>
        <translation>휴지통으로 이동(&amp;M)...</translation>
    </message>
    <message>
        <source>Choose &amp;folder...</source>
        <translation>폴더 선택(&amp;F)...</translation>
    </message>
    <message>
        <source>Show the images of a folder</source>
        <translation>폴더의 이미지를 표시합니다</translation>
    </message>
    <message>
        <source>Save s&amp;napshots in this folder</source>
        <translation>이 폴더에 스냅샷 저장(&amp;N)</translation>
    </message>
    <message>
        <source>Folder of the gallery</source>
        <translation>갤러리 폴더</translation>
    </message>
    <message>
        <source>More commands of the gallery</source>
        <translation>갤러리의 기타 명령</translation>
    </message>
    <message>
        <source>Snapshots</source>
        <translation>스냅샷</translation>
    </message>
    <message>
        <source>Choose folder</source>
        <translation>폴더 선택</translation>
    </message>
    <message>
        <source>Snapshots are saved in %1</source>
        <translation>스냅샷 저장 위치: %1</translation>
    </message>
    <message>
        <source>Snapshots (%1) and the images of a folder appear here; drag them onto report pages</source>
        <translation>스냅샷(%1)과 폴더의 이미지가 여기에 표시됩니다. 보고서 페이지로 끌어 놓을 수 있습니다</translation>
    </message>
    <message>
        <source>There are no images in %1</source>
        <translation>%1에 이미지가 없습니다</translation>
    </message>
    <message>
        <source>The folder %1 does not exist</source>
        <translation>%1 폴더가 없습니다</translation>
    </message>
    <message>
        <source>Select an image first</source>
        <translation>먼저 이미지를 선택하세요</translation>
    </message>
    <message>
        <source>Snapshots are saved in this folder already</source>
        <translation>스냅샷이 이미 이 폴더에 저장되고 있습니다</translation>
    </message>
    <message>
        <source>Move &quot;%1&quot; to the trash?</source>
        <translation>“%1” 파일을 휴지통으로 이동하시겠습니까?</translation>
    </message>
    <message>
        <source>Move to trash</source>
        <translation>휴지통으로 이동</translation>
    </message>
    <message>
        <source>Moved to the trash: %1</source>
        <translation>휴지통으로 이동함: %1</translation>
    </message>
    <message>
        <source>Not moved to the trash: %1</source>
        <translation>휴지통으로 이동하지 못함: %1</translation>
    </message>
    <message>
        <source>Measuring Desk</source>
        <translation>Measuring Desk</translation>
    </message>
    <message>
        <source>The files are still there. They are write-protected, or there is no trash for them.</source>
        <translation>파일은 그대로 남아 있습니다. 쓰기 금지되어 있거나 사용할 수 있는 휴지통이 없습니다.</translation>
    </message>
    <message numerus="yes">
        <source>Move %n selected image(s) to the trash?</source>
        <translation>
            <numerusform>선택한 이미지 %n개를 휴지통으로 이동하시겠습니까?</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>KvDeskGalleryModel</name>
    <message>
        <source>%1 × %2 px</source>
        <comment>width, height</comment>
        <translation>%1 × %2 px</translation>
    </message>
</context>
<context>
    <name>KvDeskGalleryView</name>
    <message>
        <source>Gallery</source>
        <translation>갤러리</translation>
    </message>
</context>
<context>
    <name>KvDeskGuideCommand</name>
    <message>
        <source>The user guide is not installed</source>
        <translation>사용자 가이드가 설치되어 있지 않습니다</translation>
    </message>
</context>
<context>
    <name>KvDeskGuideWindow</name>
    <message>
        <source>User guide</source>
        <translation>사용자 가이드</translation>
    </message>
    <message>
        <source>Contents</source>
        <translation>목차</translation>
    </message>
    <message>
        <source>Back</source>
        <translation>뒤로</translation>
    </message>
    <message>
        <source>Forward</source>
        <translation>앞으로</translation>
    </message>
    <message>
        <source>Find in the guide</source>
        <translation>가이드에서 찾기</translation>
    </message>
    <message>
        <source>Find previous</source>
        <translation>이전 찾기</translation>
    </message>
    <message>
        <source>Find next</source>
        <translation>다음 찾기</translation>
    </message>
    <message>
        <source>This is the first place</source>
        <translation>첫 번째 위치입니다</translation>
    </message>
    <message>
        <source>This is the last place</source>
        <translation>마지막 위치입니다</translation>
    </message>
    <message>
        <source>Not found</source>
        <translation>찾을 수 없음</translation>
    </message>
    <message>
        <source>Type what to find first</source>
        <translation>먼저 찾을 말을 입력하세요</translation>
    </message>
</context>
<context>
    <name>KvDeskImageView</name>
    <message>
        <source>Image</source>
        <translation>이미지</translation>
    </message>
    <message>
        <source>Open an image or a session to start</source>
        <translation>이미지나 세션을 열어 시작하세요</translation>
    </message>
</context>
<context>
    <name>KvDeskInlineEditor</name>
    <message>
        <source>Text</source>
        <translation>텍스트</translation>
    </message>
    <message>
        <source>Name</source>
        <translation>이름</translation>
    </message>
</context>
<context>
    <name>KvDeskKnownDistance</name>
    <message>
        <source>inch</source>
        <translation>인치</translation>
    </message>
    <message>
        <source>Use selected line</source>
        <translation>선택한 직선 사용</translation>
    </message>
    <message>
        <source>Length of the line</source>
        <translation>직선의 길이</translation>
    </message>
    <message>
        <source>Unit of the length</source>
        <translation>길이 단위</translation>
    </message>
    <message>
        <source>Its length</source>
        <translation>실제 길이</translation>
    </message>
    <message>
        <source>Draw a line over a distance that you know, such as on a stage micrometer, and select it.</source>
        <translation>대물 마이크로미터처럼 거리를 아는 곳에 직선을 긋고 선택하세요.</translation>
    </message>
    <message>
        <source>No line yet</source>
        <translation>직선 없음</translation>
    </message>
    <message>
        <source>%1: %2</source>
        <comment>name and length of a line</comment>
        <translation>%1: %2</translation>
    </message>
    <message>
        <source>Take the selected line as the known distance</source>
        <translation>선택한 직선을 기준 거리로 사용합니다</translation>
    </message>
    <message>
        <source>Select one line on the image first</source>
        <translation>먼저 이미지에서 직선을 하나 선택하세요</translation>
    </message>
</context>
<context>
    <name>KvDeskLiveBar</name>
    <message>
        <source>Live image</source>
        <translation>라이브 이미지</translation>
    </message>
    <message>
        <source>Freeze</source>
        <translation>화면 정지</translation>
    </message>
    <message>
        <source>%1 fps</source>
        <extracomment>frames per second</extracomment>
        <translation>%1 fps</translation>
    </message>
    <message>
        <source>%1 delivers no pictures any more; this is the last one</source>
        <translation>%1에서 더 이상 이미지가 수신되지 않습니다. 마지막 이미지입니다</translation>
    </message>
    <message>
        <source>%1 delivers no pictures</source>
        <translation>%1에서 이미지가 수신되지 않습니다</translation>
    </message>
    <message>
        <source>%1 is stopped</source>
        <translation>%1 중지됨</translation>
    </message>
    <message>
        <source>Waiting for the first picture of %1</source>
        <translation>%1의 첫 이미지를 기다리는 중</translation>
    </message>
    <message>
        <source>Frozen: %1</source>
        <translation>정지 화면: %1</translation>
    </message>
    <message>
        <source>Live: %1</source>
        <translation>라이브: %1</translation>
    </message>
    <message>
        <source>This image is not live</source>
        <translation>이 이미지는 라이브가 아닙니다</translation>
    </message>
    <message>
        <source>&amp;Reconnect</source>
        <translation>다시 연결(&amp;R)</translation>
    </message>
    <message>
        <source>&amp;Start</source>
        <translation>시작(&amp;S)</translation>
    </message>
    <message>
        <source>Frames per second
Dropped, because newer ones came first: %1</source>
        <translation>초당 프레임 수
더 새로운 프레임이 먼저 도착하여 버린 수: %1</translation>
    </message>
    <message>
        <source>Stop the live image; other programs can use the camera then</source>
        <translation>라이브 이미지를 중지합니다. 중지하면 다른 프로그램에서 카메라를 사용할 수 있습니다</translation>
    </message>
</context>
<context>
    <name>KvDeskMainWindow</name>
    <message>
        <source>&amp;File</source>
        <translation>파일(&amp;F)</translation>
    </message>
    <message>
        <source>&amp;Recent sessions</source>
        <translation>최근 세션(&amp;R)</translation>
    </message>
    <message>
        <source>&amp;View</source>
        <translation>보기(&amp;V)</translation>
    </message>
    <message>
        <source>&amp;Help</source>
        <translation>도움말(&amp;H)</translation>
    </message>
    <message>
        <source>Main tool bar</source>
        <translation>기본 도구 모음</translation>
    </message>
    <message>
        <source>%1[*] - Measuring Desk</source>
        <extracomment>%1 is the name of a session; [*] is replaced by a star when it has unsaved changes</extracomment>
        <translation>%1[*] - Measuring Desk</translation>
    </message>
    <message>
        <source>None yet</source>
        <translation>아직 없음</translation>
    </message>
    <message>
        <source>About Measuring Desk</source>
        <translation>Measuring Desk 정보</translation>
    </message>
    <message>
        <source>&lt;b&gt;Measuring Desk %1&lt;/b&gt;&lt;p&gt;Measures objects on images, and hosts plug-ins such as the statistics reports.&lt;/p&gt;&lt;p&gt;%2, MIT licence&lt;/p&gt;</source>
        <translation>&lt;b&gt;Measuring Desk %1&lt;/b&gt;&lt;p&gt;이미지에서 개체를 측정하고, 통계 보고서와 같은 플러그인을 실행합니다.&lt;/p&gt;&lt;p&gt;%2, MIT 라이선스&lt;/p&gt;</translation>
    </message>
    <message>
        <source>Measuring Desk</source>
        <translation>Measuring Desk</translation>
    </message>
    <message>
        <source>&amp;Edit</source>
        <translation>편집(&amp;E)</translation>
    </message>
    <message>
        <source>&amp;Image</source>
        <translation>이미지(&amp;I)</translation>
    </message>
    <message>
        <source>&amp;Measure</source>
        <translation>측정(&amp;M)</translation>
    </message>
    <message>
        <source>Choose the image source</source>
        <translation>이미지 소스 선택</translation>
    </message>
</context>
<context>
    <name>KvDeskNotice</name>
    <message>
        <source>Close this message</source>
        <translation>이 메시지 닫기</translation>
    </message>
</context>
<context>
    <name>KvDeskObjectClipboard</name>
    <message>
        <source>Type</source>
        <translation>유형</translation>
    </message>
    <message>
        <source>Object</source>
        <translation>개체</translation>
    </message>
    <message>
        <source>Value name</source>
        <translation>값 이름</translation>
    </message>
    <message>
        <source>Value</source>
        <translation>값</translation>
    </message>
</context>
<context>
    <name>KvDeskObjectEditor</name>
    <message numerus="yes">
        <source>%n objects</source>
        <comment>several measured objects</comment>
        <extracomment>%n is 2 at least</extracomment>
        <translation>
            <numerusform>개체 %n개</numerusform>
        </translation>
    </message>
    <message>
        <source>drawing of %1</source>
        <translation>%1 그리기</translation>
    </message>
    <message>
        <source>change of %1</source>
        <translation>%1 변경</translation>
    </message>
    <message>
        <source>move of %1</source>
        <translation>%1 이동</translation>
    </message>
    <message>
        <source>renaming of %1</source>
        <translation>%1 이름 바꾸기</translation>
    </message>
    <message>
        <source>text of %1</source>
        <translation>%1 텍스트 변경</translation>
    </message>
    <message>
        <source>showing of %1 of %2</source>
        <extracomment>%1 is a value, %2 an object</extracomment>
        <translation>%2의 %1 표시</translation>
    </message>
    <message>
        <source>hiding of %1 of %2</source>
        <translation>%2의 %1 숨기기</translation>
    </message>
    <message>
        <source>deletion of %1</source>
        <translation>%1 삭제</translation>
    </message>
    <message>
        <source>change of the calibration</source>
        <translation>교정 변경</translation>
    </message>
    <message>
        <source>place of %1</source>
        <translation>%1 계수점 추가</translation>
    </message>
    <message>
        <source>deletion of a place of %1</source>
        <translation>%1 계수점 삭제</translation>
    </message>
    <message>
        <source>pasting of %1</source>
        <translation>%1 붙여넣기</translation>
    </message>
    <message>
        <source>import of %1</source>
        <translation>%1 가져오기</translation>
    </message>
</context>
<context>
    <name>KvDeskPlugins</name>
    <message>
        <source>No plug-ins were found</source>
        <translation>플러그인을 찾지 못했습니다</translation>
    </message>
    <message>
        <source>It is no plug-in for this program</source>
        <translation>이 프로그램용 플러그인이 아닙니다</translation>
    </message>
    <message>
        <source>Its tools &quot;%1&quot; could not be started</source>
        <translation>“%1” 도구를 시작하지 못했습니다</translation>
    </message>
    <message>
        <source>Plug-in loaded: %1</source>
        <translation>플러그인 로드됨: %1</translation>
    </message>
    <message>
        <source>Plug-in not loaded: %1: %2</source>
        <translation>플러그인을 로드하지 못함: %1: %2</translation>
    </message>
    <message>
        <source>It failed: %1</source>
        <translation>실패: %1</translation>
    </message>
    <message>
        <source>It failed for a reason of its own</source>
        <translation>플러그인 자체의 원인으로 실패했습니다</translation>
    </message>
</context>
<context>
    <name>KvDeskProgress</name>
    <message>
        <source>Cancel</source>
        <translation>취소</translation>
    </message>
    <message>
        <source>Leave everything as it was (Esc)</source>
        <translation>아무것도 변경하지 않고 중단합니다(Esc)</translation>
    </message>
    <message>
        <source>This can no longer be cancelled</source>
        <translation>더 이상 취소할 수 없습니다</translation>
    </message>
</context>
<context>
    <name>KvDeskRecovery</name>
    <message>
        <source>Untitled session</source>
        <translation>제목 없는 세션</translation>
    </message>
    <message numerus="yes">
        <source>%1 (%n object(s))</source>
        <extracomment>%1 is the name of a session</extracomment>
        <translation>
            <numerusform>%1(개체 %n개)</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>KvDeskRecoveryBar</name>
    <message>
        <source>Show other measurements that were not saved</source>
        <translation>저장되지 않은 다른 측정 데이터를 표시합니다</translation>
    </message>
    <message>
        <source>Restore</source>
        <translation>복원</translation>
    </message>
    <message>
        <source>Open these measurements as a session with unsaved changes</source>
        <translation>이 측정 데이터를 저장되지 않은 변경 내용이 있는 세션으로 엽니다</translation>
    </message>
    <message>
        <source>Discard</source>
        <translation>버리기</translation>
    </message>
    <message>
        <source>Delete these measurements for good</source>
        <translation>이 측정 데이터를 완전히 삭제합니다</translation>
    </message>
    <message>
        <source>%1: %2</source>
        <extracomment>%1 is a time, %2 a session</extracomment>
        <translation>%1: %2</translation>
    </message>
    <message numerus="yes">
        <source>%n more</source>
        <comment>measurements that were not saved</comment>
        <translation>
            <numerusform>외 %n건</numerusform>
        </translation>
    </message>
    <message>
        <source>Measurements from %1 were not saved.</source>
        <translation>%1의 측정 데이터가 저장되지 않았습니다.</translation>
    </message>
</context>
<context>
    <name>KvDeskRuler</name>
    <message>
        <source>Horizontal ruler</source>
        <translation>가로 눈금자</translation>
    </message>
    <message>
        <source>Vertical ruler</source>
        <translation>세로 눈금자</translation>
    </message>
    <message>
        <source>Ruler in %1</source>
        <translation>눈금자(%1)</translation>
    </message>
</context>
<context>
    <name>KvDeskSelectionStatistics</name>
    <message>
        <source>n = %1, mean %2, SD %3, min %4, max %5</source>
        <extracomment>number of values, their mean, standard deviation, smallest and largest one</extracomment>
        <translation>n = %1, 평균 %2, SD %3, 최소 %4, 최대 %5</translation>
    </message>
    <message>
        <source>Selected values: %1</source>
        <translation>선택한 값: %1</translation>
    </message>
    <message>
        <source>Mean: %1</source>
        <translation>평균: %1</translation>
    </message>
    <message>
        <source>Standard deviation: %1</source>
        <translation>표준편차: %1</translation>
    </message>
    <message>
        <source>Smallest: %1</source>
        <translation>최소: %1</translation>
    </message>
    <message>
        <source>Largest: %1</source>
        <translation>최대: %1</translation>
    </message>
</context>
<context>
    <name>KvDeskSession</name>
    <message>
        <source>Untitled session</source>
        <translation>제목 없는 세션</translation>
    </message>
</context>
<context>
    <name>KvDeskSettingsDialog</name>
    <message>
        <source>Settings</source>
        <translation>설정</translation>
    </message>
    <message>
        <source>Appearance</source>
        <translation>모양</translation>
    </message>
    <message>
        <source>Theme</source>
        <translation>테마</translation>
    </message>
    <message>
        <source>Dark</source>
        <translation>어둡게</translation>
    </message>
    <message>
        <source>Light</source>
        <translation>밝게</translation>
    </message>
    <message>
        <source>Language</source>
        <translation>언어</translation>
    </message>
    <message>
        <source>Another language takes effect when the program is started again.</source>
        <translation>언어 변경은 프로그램을 다시 시작하면 적용됩니다.</translation>
    </message>
    <message>
        <source>Measured values</source>
        <translation>측정값</translation>
    </message>
    <message>
        <source>Automatic</source>
        <translation>자동</translation>
    </message>
    <message>
        <source>Significant digits</source>
        <translation>유효 자릿수</translation>
    </message>
    <message>
        <source>Length unit</source>
        <translation>길이 단위</translation>
    </message>
    <message>
        <source>Angle unit</source>
        <translation>각도 단위</translation>
    </message>
    <message>
        <source>Degrees (°)</source>
        <translation>도(°)</translation>
    </message>
    <message>
        <source>Radians (rad)</source>
        <translation>라디안(rad)</translation>
    </message>
    <message>
        <source>System default</source>
        <translation>시스템 기본값</translation>
    </message>
    <message>
        <source>Nothing was changed yet</source>
        <translation>아직 변경한 것이 없습니다</translation>
    </message>
</context>
<context>
    <name>KvDeskSnapshotFile</name>
    <message>
        <source>The folder cannot be created</source>
        <translation>폴더를 만들 수 없습니다</translation>
    </message>
    <message>
        <source>The picture cannot be encoded</source>
        <translation>이미지를 인코딩할 수 없습니다</translation>
    </message>
</context>
<context>
    <name>KvDeskSnapshots</name>
    <message>
        <source>Open an image first</source>
        <translation>먼저 이미지를 여세요</translation>
    </message>
    <message>
        <source>No snapshot was taken: earlier ones are still being saved</source>
        <translation>이전 스냅샷을 저장하는 중이므로 스냅샷을 찍지 못했습니다</translation>
    </message>
    <message>
        <source>Snapshot saved: %1</source>
        <translation>스냅샷 저장됨: %1</translation>
    </message>
    <message>
        <source>The snapshot was not saved. %1</source>
        <translation>스냅샷을 저장하지 못했습니다. %1</translation>
    </message>
</context>
<context>
    <name>KvDeskSourceCommands</name>
    <message>
        <source>The image source &quot;%1&quot; was not opened.</source>
        <translation>“%1” 이미지 소스를 열지 못했습니다.</translation>
    </message>
    <message>
        <source>Image source: %1</source>
        <translation>이미지 소스: %1</translation>
    </message>
    <message>
        <source>Open image folder</source>
        <translation>이미지 폴더 열기</translation>
    </message>
    <message>
        <source>Open video</source>
        <translation>동영상 열기</translation>
    </message>
    <message>
        <source>Videos</source>
        <translation>동영상</translation>
    </message>
</context>
<context>
    <name>KvDeskSourceMenu</name>
    <message>
        <source>Image &amp;source</source>
        <translation>이미지 소스(&amp;S)</translation>
    </message>
    <message>
        <source>Still &amp;image...</source>
        <translation>정지 이미지(&amp;I)...</translation>
    </message>
    <message>
        <source>Image &amp;folder...</source>
        <translation>이미지 폴더(&amp;F)...</translation>
    </message>
    <message>
        <source>Play the images of a folder like a camera</source>
        <translation>폴더의 이미지를 카메라처럼 재생합니다</translation>
    </message>
    <message>
        <source>&amp;Video...</source>
        <translation>동영상(&amp;V)...</translation>
    </message>
    <message>
        <source>Play a video like a camera</source>
        <translation>동영상을 카메라처럼 재생합니다</translation>
    </message>
    <message>
        <source>Looking for cameras...</source>
        <translation>카메라 찾는 중...</translation>
    </message>
    <message>
        <source>No camera is connected</source>
        <translation>연결된 카메라 없음</translation>
    </message>
</context>
<context>
    <name>KvDeskStartPage</name>
    <message>
        <source>From an image to a report</source>
        <translation>이미지에서 보고서까지</translation>
    </message>
    <message>
        <source>Back to the image</source>
        <translation>이미지로 돌아가기</translation>
    </message>
    <message>
        <source>%1 (%2)</source>
        <comment>command (shortcut)</comment>
        <translation>%1(%2)</translation>
    </message>
    <message>
        <source>Open an image</source>
        <translation>이미지 열기</translation>
    </message>
    <message>
        <source>A picture file, or the live image of a camera.</source>
        <translation>이미지 파일 또는 카메라의 라이브 이미지입니다.</translation>
    </message>
    <message>
        <source>Choose a camera or another source</source>
        <translation>카메라 또는 다른 소스 선택</translation>
    </message>
    <message>
        <source>Calibrate</source>
        <translation>교정</translation>
    </message>
    <message>
        <source>Say how large a pixel is. The examples are calibrated already.</source>
        <translation>픽셀 하나의 크기를 지정합니다. 예제는 이미 교정되어 있습니다.</translation>
    </message>
    <message>
        <source>Measure and report</source>
        <translation>측정 및 보고서 작성</translation>
    </message>
    <message>
        <source>Drag a line over the image: its length is listed at once. The report panel makes a PDF of all values.</source>
        <translation>이미지 위에서 끌어 직선을 그리면 길이가 바로 목록에 표시됩니다. 보고서 패널에서 모든 값을 PDF로 만들 수 있습니다.</translation>
    </message>
    <message>
        <source>Examples to try</source>
        <translation>예제로 시작하기</translation>
    </message>
    <message>
        <source>Recent sessions</source>
        <translation>최근 세션</translation>
    </message>
    <message>
        <source>Open an image first</source>
        <translation>먼저 이미지를 여세요</translation>
    </message>
    <message>
        <source>Open a copy of this example</source>
        <translation>이 예제의 사본 열기</translation>
    </message>
</context>
<context>
    <name>KvDeskStatus</name>
    <message>
        <source>Warning</source>
        <translation>경고</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>오류</translation>
    </message>
    <message>
        <source>Information</source>
        <translation>정보</translation>
    </message>
</context>
<context>
    <name>KvDeskStatusBar</name>
    <message>
        <source>%1 × %2 px</source>
        <translation>%1 × %2 px</translation>
    </message>
    <message>
        <source>%1 %</source>
        <comment>zoom</comment>
        <translation>%1%</translation>
    </message>
    <message>
        <source>x %1, y %2</source>
        <comment>pixel below the pointer</comment>
        <translation>x %1, y %2</translation>
    </message>
    <message>
        <source>Statistics of the selected values</source>
        <translation>선택한 값의 통계</translation>
    </message>
    <message>
        <source>, %1</source>
        <comment>objective</comment>
        <translation>, %1</translation>
    </message>
    <message>
        <source>, %1/px</source>
        <comment>size of a pixel</comment>
        <translation>, %1/px</translation>
    </message>
</context>
<context>
    <name>KvDeskStatusLog</name>
    <message>
        <source>Status log</source>
        <translation>상태 로그</translation>
    </message>
    <message>
        <source>Hide the status log</source>
        <translation>상태 로그 숨기기</translation>
    </message>
    <message>
        <source>Clear the status log</source>
        <translation>상태 로그 지우기</translation>
    </message>
    <message>
        <source>Messages of the program and its plug-ins appear here</source>
        <translation>프로그램과 플러그인의 메시지가 여기에 표시됩니다</translation>
    </message>
    <message>
        <source>There are no messages</source>
        <translation>메시지가 없습니다</translation>
    </message>
</context>
<context>
    <name>KvDeskStatusLogModel</name>
    <message>
        <source>%1
Reported by %2</source>
        <comment>message, source</comment>
        <translation>%1
보고한 곳: %2</translation>
    </message>
    <message>
        <source>Category</source>
        <translation>분류</translation>
    </message>
    <message>
        <source>Time</source>
        <translation>시각</translation>
    </message>
    <message>
        <source>Message</source>
        <translation>메시지</translation>
    </message>
</context>
<context>
    <name>KvDeskTableView</name>
    <message>
        <source>Copy</source>
        <translation>복사</translation>
    </message>
</context>
<context>
    <name>KvDeskToolStrip</name>
    <message>
        <source>Measuring tools</source>
        <translation>측정 도구</translation>
    </message>
</context>
<context>
    <name>KvDeskTypedPixelSize</name>
    <message>
        <source>Width of a pixel in micrometres</source>
        <translation>픽셀의 너비(마이크로미터)</translation>
    </message>
    <message>
        <source>Height of a pixel in micrometres</source>
        <translation>픽셀의 높이(마이크로미터)</translation>
    </message>
    <message>
        <source>Same size in both directions</source>
        <translation>가로세로 같은 크기</translation>
    </message>
    <message>
        <source>Width</source>
        <translation>너비</translation>
    </message>
    <message>
        <source>Height</source>
        <translation>높이</translation>
    </message>
    <message>
        <source>Type how large a pixel of the image is in reality.</source>
        <translation>이미지의 픽셀 하나가 실제로 얼마나 큰지 입력하세요.</translation>
    </message>
</context>
<context>
    <name>KvDeskValueCommands</name>
    <message>
        <source>Rename</source>
        <translation>이름 바꾸기</translation>
    </message>
    <message>
        <source>Delete object</source>
        <translation>개체 삭제</translation>
    </message>
    <message>
        <source>Hide value</source>
        <translation>값 숨기기</translation>
    </message>
    <message>
        <source>Show all values of the object</source>
        <translation>개체의 모든 값 표시</translation>
    </message>
    <message>
        <source>Select one object first</source>
        <translation>먼저 개체를 하나만 선택하세요</translation>
    </message>
    <message>
        <source>Select an object first</source>
        <translation>먼저 개체를 선택하세요</translation>
    </message>
    <message>
        <source>Select a value first</source>
        <translation>먼저 값을 선택하세요</translation>
    </message>
    <message>
        <source>No value of the selected object is hidden</source>
        <translation>선택한 개체에 숨긴 값이 없습니다</translation>
    </message>
    <message>
        <source>showing of values</source>
        <translation>값 표시</translation>
    </message>
    <message>
        <source>hiding of values</source>
        <translation>값 숨기기</translation>
    </message>
</context>
<context>
    <name>KvDeskValueTable</name>
    <message>
        <source>Measured values</source>
        <translation>측정값</translation>
    </message>
    <message>
        <source>Hide the measured values</source>
        <translation>측정값 숨기기</translation>
    </message>
    <message>
        <source>Filter by type, object or value name</source>
        <translation>유형, 개체, 값 이름으로 필터링</translation>
    </message>
    <message>
        <source>Filter of the measured values</source>
        <translation>측정값 필터</translation>
    </message>
    <message>
        <source>Shows only rows that have all of these words</source>
        <translation>입력한 단어가 모두 들어 있는 행만 표시합니다</translation>
    </message>
    <message>
        <source>No measured value matches the filter</source>
        <translation>필터와 일치하는 측정값이 없습니다</translation>
    </message>
    <message>
        <source>Clear the filter</source>
        <translation>필터 지우기</translation>
    </message>
    <message>
        <source>%1 of %2</source>
        <extracomment>rows that match the filter, all rows</extracomment>
        <translation>%1 / %2</translation>
    </message>
    <message>
        <source>Measured values appear here once something is measured or imported</source>
        <translation>측정하거나 가져오면 측정값이 여기에 표시됩니다</translation>
    </message>
    <message>
        <source>There are no measured values yet</source>
        <translation>아직 측정값이 없습니다</translation>
    </message>
</context>
<context>
    <name>KvDeskValueTableModel</name>
    <message>
        <source>Type</source>
        <translation>유형</translation>
    </message>
    <message>
        <source>Object</source>
        <translation>개체</translation>
    </message>
    <message>
        <source>Value name</source>
        <translation>값 이름</translation>
    </message>
    <message>
        <source>Value</source>
        <translation>값</translation>
    </message>
</context>
<context>
    <name>KvToolBase</name>
    <message>
        <source>Reset</source>
        <translation>초기화</translation>
    </message>
    <message>
        <source>Reset to the default values</source>
        <translation>기본값으로 되돌리기</translation>
    </message>
</context>
<context>
    <name>QPlatformTheme</name>
    <message>
        <source>OK</source>
        <translation>확인</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>취소</translation>
    </message>
    <message>
        <source>Apply</source>
        <translation>적용</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>저장</translation>
    </message>
    <message>
        <source>Open</source>
        <translation>열기</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>닫기</translation>
    </message>
    <message>
        <source>Discard</source>
        <translation>버리기</translation>
    </message>
    <message>
        <source>&amp;Yes</source>
        <translation>예(&amp;Y)</translation>
    </message>
    <message>
        <source>&amp;No</source>
        <translation>아니요(&amp;N)</translation>
    </message>
</context>
<context>
    <name>ZtAppSettings</name>
    <message>
        <source>The settings could not be saved to %1. Check that the folder is writable.</source>
        <translation>설정을 %1에 저장하지 못했습니다. 폴더에 쓸 수 있는지 확인하세요.</translation>
    </message>
    <message>
        <source>The settings file %1 cannot be read. Changes to the settings will not be kept.</source>
        <translation>설정 파일 %1을(를) 읽을 수 없습니다. 설정 변경 내용은 유지되지 않습니다.</translation>
    </message>
    <message>
        <source>The settings file %1 is damaged. It was renamed to %2; all settings are back at their defaults.</source>
        <translation>설정 파일 %1이(가) 손상되었습니다. 파일 이름을 %2(으)로 바꾸고 모든 설정을 기본값으로 되돌렸습니다.</translation>
    </message>
    <message>
        <source>The settings file %1 is damaged and could not be renamed to %2. Changes to the settings will not be kept.</source>
        <translation>설정 파일 %1이(가) 손상되었으며 파일 이름을 %2(으)로 바꾸지 못했습니다. 설정 변경 내용은 유지되지 않습니다.</translation>
    </message>
</context>
<context>
    <name>ZtAravisSource</name>
    <message>
        <source>%1 is disconnected; its last picture stays</source>
        <translation>%1의 연결이 끊겼습니다. 마지막 이미지를 계속 표시합니다</translation>
    </message>
    <message>
        <source>%1 delivers pictures of a kind that cannot be shown</source>
        <translation>%1에서 수신되는 이미지는 표시할 수 없는 형식입니다</translation>
    </message>
    <message>
        <source>The camera does not take the setting (%1)</source>
        <translation>카메라가 설정을 받아들이지 않습니다(%1)</translation>
    </message>
    <message>
        <source>%1 cannot be opened (%2)</source>
        <translation>%1을(를) 열 수 없습니다(%2)</translation>
    </message>
</context>
<context>
    <name>ZtCalibrationStore</name>
    <message>
        <source>This is not a calibration</source>
        <translation>교정 데이터가 아닙니다</translation>
    </message>
    <message>
        <source>A calibration in the settings is damaged and was left out (%1: %2)</source>
        <translation>설정에 있는 교정 하나가 손상되어 제외했습니다(%1: %2)</translation>
    </message>
</context>
<context>
    <name>ZtCsvReader</name>
    <message>
        <source>A quoted text does not end</source>
        <translation>따옴표로 묶은 텍스트가 닫히지 않았습니다</translation>
    </message>
    <message>
        <source>There is text after a closing quote</source>
        <translation>닫는 따옴표 뒤에 텍스트가 있습니다</translation>
    </message>
    <message>
        <source>Reading was cancelled</source>
        <translation>읽기가 취소되었습니다</translation>
    </message>
</context>
<context>
    <name>ZtDrawnType</name>
    <message>
        <source>Rectangle</source>
        <translation>직사각형</translation>
    </message>
    <message>
        <source>Width</source>
        <translation>너비</translation>
    </message>
    <message>
        <source>Height</source>
        <translation>높이</translation>
    </message>
    <message>
        <source>Area</source>
        <translation>면적</translation>
    </message>
    <message>
        <source>Line</source>
        <translation>직선</translation>
    </message>
    <message>
        <source>Length</source>
        <translation>길이</translation>
    </message>
    <message>
        <source>Arc</source>
        <translation>원호</translation>
    </message>
    <message>
        <source>Angle</source>
        <translation>각도</translation>
    </message>
    <message>
        <source>Arc length</source>
        <translation>원호 길이</translation>
    </message>
    <message>
        <source>Polygon</source>
        <translation>다각형</translation>
    </message>
    <message>
        <source>Perimeter</source>
        <translation>둘레</translation>
    </message>
    <message>
        <source>Polyline</source>
        <translation>폴리라인</translation>
    </message>
    <message>
        <source>Parallel distance</source>
        <translation>평행 거리</translation>
    </message>
    <message>
        <source>Distance</source>
        <translation>거리</translation>
    </message>
    <message>
        <source>Text note</source>
        <translation>텍스트 주석</translation>
    </message>
    <message>
        <source>Scale bar</source>
        <translation>스케일 바</translation>
    </message>
    <message>
        <source>Counter</source>
        <translation>카운터</translation>
    </message>
    <message>
        <source>Count</source>
        <translation>개수</translation>
    </message>
    <message>
        <source>Share</source>
        <translation>비율</translation>
    </message>
    <message>
        <source>Circle</source>
        <translation>원</translation>
    </message>
    <message>
        <source>Diameter</source>
        <translation>지름</translation>
    </message>
</context>
<context>
    <name>ZtFileFault</name>
    <message>
        <source>No such file or directory</source>
        <translation>그런 파일이나 디렉터리가 없습니다</translation>
    </message>
    <message>
        <source>Permission denied</source>
        <translation>허가 거부</translation>
    </message>
    <message>
        <source>Is a directory</source>
        <translation>디렉터리입니다</translation>
    </message>
    <message>
        <source>Not a directory</source>
        <translation>디렉터리가 아닙니다</translation>
    </message>
    <message>
        <source>File name too long</source>
        <translation>파일 이름이 너무 깁니다</translation>
    </message>
    <message>
        <source>No space left on device</source>
        <translation>장치에 남은 공간이 없음</translation>
    </message>
    <message>
        <source>Read-only file system</source>
        <translation>읽기전용 파일 시스템</translation>
    </message>
    <message>
        <source>Input/output error</source>
        <translation>입력/출력 오류</translation>
    </message>
</context>
<context>
    <name>ZtFrameSourceCatalogue</name>
    <message>
        <source>This program cannot play videos</source>
        <translation>이 프로그램에서는 동영상을 재생할 수 없습니다</translation>
    </message>
    <message>
        <source>This program knows no cameras of this kind</source>
        <translation>이 종류의 카메라는 지원하지 않습니다</translation>
    </message>
</context>
<context>
    <name>ZtImageFolderSource</name>
    <message>
        <source>%1: no picture of the folder can be shown</source>
        <translation>%1: 폴더에 표시할 수 있는 이미지가 없습니다</translation>
    </message>
    <message>
        <source>The folder does not exist</source>
        <translation>폴더가 없습니다</translation>
    </message>
    <message>
        <source>The folder cannot be read</source>
        <translation>폴더를 읽을 수 없습니다</translation>
    </message>
    <message>
        <source>The folder holds no pictures</source>
        <translation>폴더에 이미지가 없습니다</translation>
    </message>
</context>
<context>
    <name>ZtKernelImage</name>
    <message>
        <source>%1 delivers pictures again</source>
        <translation>%1에서 이미지가 다시 수신됩니다</translation>
    </message>
</context>
<context>
    <name>ZtLiveFrameSource</name>
    <message>
        <source>%1 has stopped delivering pictures; the last one stays</source>
        <translation>%1에서 이미지가 수신되지 않습니다. 마지막 이미지를 계속 표시합니다</translation>
    </message>
</context>
<context>
    <name>ZtMeasureFormat</name>
    <message>
        <source>pcs</source>
        <translation>개</translation>
    </message>
</context>
<context>
    <name>ZtSession</name>
    <message>
        <source>The file is empty</source>
        <translation>파일이 비어 있습니다</translation>
    </message>
    <message>
        <source>The file is not a session</source>
        <translation>세션 파일이 아닙니다</translation>
    </message>
    <message>
        <source>The file cannot be written (%1)</source>
        <translation>파일에 쓸 수 없습니다(%1)</translation>
    </message>
    <message>
        <source>This must be a list</source>
        <translation>목록이어야 합니다</translation>
    </message>
    <message>
        <source>This must be a text</source>
        <translation>텍스트여야 합니다</translation>
    </message>
    <message>
        <source>This must be a whole number from 1</source>
        <translation>1 이상의 정수여야 합니다</translation>
    </message>
    <message>
        <source>This must be a number</source>
        <translation>숫자여야 합니다</translation>
    </message>
    <message>
        <source>This must be a number greater than 0</source>
        <translation>0보다 큰 숫자여야 합니다</translation>
    </message>
    <message>
        <source>Another object of this type has the same number</source>
        <translation>같은 유형의 다른 개체가 이 번호를 사용합니다</translation>
    </message>
    <message>
        <source>This must be an object</source>
        <translation>JSON 객체여야 합니다</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is not a type of objects</source>
        <translation>“%1”은(는) 개체 유형이 아닙니다</translation>
    </message>
    <message>
        <source>An object of type &quot;%1&quot; cannot have this number of points (%2)</source>
        <translation>“%1” 유형의 개체는 점을 이 개수만큼 가질 수 없습니다(%2)</translation>
    </message>
    <message>
        <source>A point must be a list of two numbers between -1e9 and 1e9</source>
        <translation>점은 -1e9에서 1e9 사이의 숫자 두 개로 된 목록이어야 합니다</translation>
    </message>
    <message>
        <source>This must be the name of a value</source>
        <translation>값 이름이어야 합니다</translation>
    </message>
    <message>
        <source>The type has no name</source>
        <translation>유형에 이름이 없습니다</translation>
    </message>
    <message>
        <source>A value must have a name of its own</source>
        <translation>값에는 고유한 이름이 있어야 합니다</translation>
    </message>
    <message>
        <source>The numbers of the rows must rise</source>
        <translation>행 번호는 오름차순이어야 합니다</translation>
    </message>
    <message>
        <source>A row must be a list of number, name and values</source>
        <translation>행은 번호, 이름, 값의 목록이어야 합니다</translation>
    </message>
    <message>
        <source>This must be a text or null</source>
        <translation>텍스트 또는 null이어야 합니다</translation>
    </message>
    <message>
        <source>This must be a list or an object</source>
        <translation>목록 또는 JSON 객체여야 합니다</translation>
    </message>
    <message>
        <source>The table has no such value</source>
        <translation>표에 이 값이 없습니다</translation>
    </message>
    <message>
        <source>This must be the text of a number</source>
        <translation>숫자를 나타내는 텍스트여야 합니다</translation>
    </message>
    <message>
        <source>The unit does not fit that of the value</source>
        <translation>단위가 값의 단위와 맞지 않습니다</translation>
    </message>
    <message>
        <source>The file is nested too deeply</source>
        <translation>파일의 중첩이 너무 깊습니다</translation>
    </message>
    <message>
        <source>The file is not valid JSON (%1)</source>
        <translation>파일이 올바른 JSON이 아닙니다(%1)</translation>
    </message>
    <message>
        <source>The file does not exist</source>
        <translation>파일이 없습니다</translation>
    </message>
    <message>
        <source>This is a folder, not a file</source>
        <translation>파일이 아니라 폴더입니다</translation>
    </message>
    <message>
        <source>The file cannot be read (%1)</source>
        <translation>파일을 읽을 수 없습니다(%1)</translation>
    </message>
    <message>
        <source>The file is too large for a session</source>
        <translation>파일이 세션으로 쓰기에는 너무 큽니다</translation>
    </message>
    <message>
        <source>This must be a date such as 2026-01-31T12:00:00Z</source>
        <translation>2026-01-31T12:00:00Z와 같은 날짜여야 합니다</translation>
    </message>
    <message>
        <source>This must be &quot;knownDistance&quot;, &quot;metadata&quot; or &quot;typed&quot;</source>
        <translation>&quot;knownDistance&quot;, &quot;metadata&quot;, &quot;typed&quot; 중 하나여야 합니다</translation>
    </message>
    <message>
        <source>The file is write-protected</source>
        <translation>파일이 쓰기 금지되어 있습니다</translation>
    </message>
    <message>
        <source>Writing was cancelled</source>
        <translation>쓰기가 취소되었습니다</translation>
    </message>
    <message>
        <source>Reading was cancelled</source>
        <translation>읽기가 취소되었습니다</translation>
    </message>
    <message>
        <source>The session is of the newer version %1; this program reads versions up to %2</source>
        <translation>세션이 더 새로운 버전 %1입니다. 이 프로그램은 버전 %2까지 읽을 수 있습니다</translation>
    </message>
    <message>
        <source>Sessions of version %1 are not known; this program reads versions %2 to %3</source>
        <translation>버전 %1의 세션은 지원하지 않습니다. 이 프로그램은 버전 %2~%3만 읽을 수 있습니다</translation>
    </message>
    <message>
        <source>This file is a table of values; import it</source>
        <translation>이 파일은 값 표입니다. 가져오기를 사용하세요</translation>
    </message>
</context>
<context>
    <name>ZtStillImageSource</name>
    <message>
        <source>The picture does not exist</source>
        <translation>이미지가 없습니다</translation>
    </message>
    <message>
        <source>This is a folder, not a picture</source>
        <translation>이미지가 아니라 폴더입니다</translation>
    </message>
    <message>
        <source>The picture cannot be read</source>
        <translation>이미지를 읽을 수 없습니다</translation>
    </message>
    <message>
        <source>The picture has %1 x %2 pixels, which is too many</source>
        <translation>이미지의 픽셀이 너무 많습니다(%1 x %2픽셀)</translation>
    </message>
    <message>
        <source>The picture cannot be decoded (%1)</source>
        <translation>이미지를 디코딩할 수 없습니다(%1)</translation>
    </message>
    <message>
        <source>the file is empty</source>
        <translation>파일이 비어 있음</translation>
    </message>
    <message>
        <source>it has no size</source>
        <translation>크기가 없음</translation>
    </message>
    <message>
        <source>the file is damaged</source>
        <translation>파일이 손상됨</translation>
    </message>
    <message>
        <source>the file is too short for its picture</source>
        <translation>파일이 이미지에 비해 너무 짧음</translation>
    </message>
    <message>
        <source>there is not enough memory</source>
        <translation>메모리가 부족함</translation>
    </message>
</context>
<context>
    <name>ZtTableImport</name>
    <message>
        <source>&quot;%1&quot; already has a value &quot;%2&quot; in line %3</source>
        <translation>“%1”에는 이미 %3번째 줄에 “%2” 값이 있습니다</translation>
    </message>
    <message>
        <source>The file does not exist</source>
        <translation>파일이 없습니다</translation>
    </message>
    <message>
        <source>This is a folder, not a file</source>
        <translation>파일이 아니라 폴더입니다</translation>
    </message>
    <message>
        <source>The file cannot be read (%1)</source>
        <translation>파일을 읽을 수 없습니다(%1)</translation>
    </message>
    <message>
        <source>The table is not open for reading</source>
        <translation>표가 읽기용으로 열려 있지 않습니다</translation>
    </message>
    <message>
        <source>The table has no rows</source>
        <translation>표에 행이 없습니다</translation>
    </message>
    <message>
        <source>The row and the header differ in their number of fields (%1 and %2)</source>
        <translation>행과 머리글 행의 필드 수가 다릅니다(%1개와 %2개)</translation>
    </message>
    <message>
        <source>%1 is not a finite number</source>
        <translation>%1은(는) 유한한 수가 아닙니다</translation>
    </message>
    <message>
        <source>%1 is not a number</source>
        <translation>%1은(는) 숫자가 아닙니다</translation>
    </message>
    <message>
        <source>&quot;%1&quot; of &quot;%2&quot; is given in &quot;%3&quot; here, but in &quot;%4&quot; before</source>
        <translation>“%2”의 “%1” 단위가 여기서는 “%3”이지만 앞에서는 “%4”입니다</translation>
    </message>
    <message>
        <source>There is no column %1; the columns are %2</source>
        <translation>%1 열이 없습니다. 있는 열: %2</translation>
    </message>
    <message>
        <source>Object</source>
        <translation>개체</translation>
    </message>
    <message>
        <source>There is no value %1 to give a unit; the values are %2</source>
        <translation>단위를 지정할 %1 값이 없습니다. 있는 값: %2</translation>
    </message>
    <message>
        <source>The first line announces rows without values</source>
        <translation>첫 줄에 값이 없는 행이 선언되어 있습니다</translation>
    </message>
    <message>
        <source>There is no column %1; the columns of this table have no names</source>
        <translation>%1 열이 없습니다. 이 표의 열에는 이름이 없습니다</translation>
    </message>
    <message>
        <source>%1 is not the index of a class; they go from 0 to %2</source>
        <translation>%1은(는) 클래스 인덱스가 아닙니다. 범위는 0~%2입니다</translation>
    </message>
    <message>
        <source>Value %1</source>
        <translation>값 %1</translation>
    </message>
    <message>
        <source>The file is larger than %1 MB</source>
        <translation>파일이 %1MB보다 큽니다</translation>
    </message>
    <message>
        <source>The file is empty</source>
        <translation>파일이 비어 있습니다</translation>
    </message>
    <message>
        <source>The first line does not name the columns</source>
        <translation>첫 줄에 열 이름이 없습니다</translation>
    </message>
    <message>
        <source>Column %1 is not part of a list of values and was left out</source>
        <translation>%1 열은 값 목록에 속하지 않아 제외했습니다</translation>
    </message>
    <message>
        <source>Columns %1 are not part of a list of values and were left out</source>
        <translation>%1 열은 값 목록에 속하지 않아 제외했습니다</translation>
    </message>
    <message>
        <source>The value has no name</source>
        <translation>값에 이름이 없습니다</translation>
    </message>
    <message>
        <source>The row does not say which object it belongs to</source>
        <translation>행이 어느 개체에 속하는지 나와 있지 않습니다</translation>
    </message>
    <message>
        <source>%1 is not a unit</source>
        <translation>%1은(는) 단위가 아닙니다</translation>
    </message>
    <message>
        <source>There is no column of numbers</source>
        <translation>숫자 열이 없습니다</translation>
    </message>
    <message>
        <source>Column %1</source>
        <translation>열 %1</translation>
    </message>
    <message>
        <source>Column %1 holds text and was left out</source>
        <translation>%1 열은 텍스트가 들어 있어 제외했습니다</translation>
    </message>
    <message>
        <source>Columns %1 hold text and were left out</source>
        <translation>%1 열은 텍스트가 들어 있어 제외했습니다</translation>
    </message>
    <message>
        <source>Reading was cancelled</source>
        <translation>읽기가 취소되었습니다</translation>
    </message>
    <message numerus="yes">
        <source>The table has %n row(s), its first line announces %1</source>
        <translation>
            <numerusform>표의 행은 %n개이지만 첫 줄에는 %1개로 선언되어 있습니다</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>The row has %n field(s) instead of %1</source>
        <translation>
            <numerusform>행의 필드가 %1개가 아니라 %n개입니다</numerusform>
        </translation>
    </message>
    <message>
        <source>The records have too many different names</source>
        <translation>레코드에 서로 다른 이름이 너무 많습니다</translation>
    </message>
    <message>
        <source>This file is a session, not a table; open it</source>
        <translation>이 파일은 표가 아니라 세션입니다. 여세요</translation>
    </message>
    <message>
        <source>The file is neither a list of records nor an export of values</source>
        <translation>이 파일은 레코드 목록도, 내보낸 값도 아닙니다</translation>
    </message>
    <message>
        <source>This name comes twice</source>
        <translation>이 이름이 두 번 나옵니다</translation>
    </message>
    <message>
        <source>This must be a text, a number or null</source>
        <translation>여기에는 텍스트, 숫자 또는 null이 있어야 합니다</translation>
    </message>
    <message>
        <source>The table is of version %1; this program reads version %2</source>
        <translation>표의 버전은 %1입니다. 이 프로그램은 버전 %2을(를) 읽습니다</translation>
    </message>
</context>
<context>
    <name>ZtTextDecoder</name>
    <message>
        <source>The file is not a text file: it holds a NUL character</source>
        <translation>텍스트 파일이 아닙니다. NUL 문자가 들어 있습니다</translation>
    </message>
    <message>
        <source>The file is not valid UTF-16 text</source>
        <translation>올바른 UTF-16 텍스트 파일이 아닙니다</translation>
    </message>
    <message>
        <source>The text is not valid UTF-8</source>
        <translation>텍스트가 올바른 UTF-8이 아닙니다</translation>
    </message>
</context>
<context>
    <name>ZtUvcCameraSource</name>
    <message>
        <source>%1 is not connected</source>
        <translation>%1이(가) 연결되어 있지 않습니다</translation>
    </message>
    <message>
        <source>%1 is disconnected or in use (%2)</source>
        <translation>%1의 연결이 끊겼거나 다른 곳에서 사용 중입니다(%2)</translation>
    </message>
</context>
<context>
    <name>ZtVideoFileSource</name>
    <message>
        <source>The video does not exist</source>
        <translation>동영상이 없습니다</translation>
    </message>
    <message>
        <source>The video cannot be read</source>
        <translation>동영상을 읽을 수 없습니다</translation>
    </message>
    <message>
        <source>The video is empty</source>
        <translation>동영상이 비어 있습니다</translation>
    </message>
    <message>
        <source>there is only sound in it</source>
        <translation>소리만 들어 있음</translation>
    </message>
    <message>
        <source>The video %1 cannot be played (%2)</source>
        <translation>동영상 %1을(를) 재생할 수 없습니다(%2)</translation>
    </message>
    <message>
        <source>the file is damaged</source>
        <translation>파일이 손상됨</translation>
    </message>
</context>
<context>
    <name>acss</name>
    <message>
        <source>The icon %1 is missing.</source>
        <translation>아이콘 %1이(가) 없습니다.</translation>
    </message>
</context>
</TS>
