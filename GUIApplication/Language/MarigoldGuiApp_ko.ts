<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="ko_KR">
<context>
    <name>CalibrationNeededPopup</name>
    <message>
        <source>Calibration Required</source>
        <translation>교정 필요</translation>
    </message>
    <message>
        <source>New measurements cannot be made until the instrument is calibrated. Press Calibrate to start the calibration sequence.</source>
        <translation>기기를 교정하기 전에는 새 측정을 할 수 없습니다. 교정을 눌러 교정을 시작하십시오.</translation>
    </message>
    <message>
        <source>Ignore</source>
        <translation>무시</translation>
    </message>
    <message>
        <source>Calibrate</source>
        <translation>교정</translation>
    </message>
    <message>
        <source>Calibration needed within %1 %2</source>
        <translation>%1 %2 이내에 교정 필요</translation>
    </message>
    <message>
        <source>seconds</source>
        <translation>초</translation>
    </message>
    <message>
        <source>minutes</source>
        <translation>분</translation>
    </message>
    <message>
        <source>hours</source>
        <translation>시간</translation>
    </message>
    <message>
        <source>days</source>
        <translation>일</translation>
    </message>
</context>
<context>
    <name>CalibrationPopup</name>
    <message>
        <source>Calibration Starting</source>
        <translation>교정 시작</translation>
    </message>
    <message>
        <source>Calibrating</source>
        <translation>교정 중</translation>
    </message>
    <message>
        <source>Do not touch or bump instrument</source>
        <translation>기기를 만지거나 부딪히지 마십시오</translation>
    </message>
    <message>
        <source>Calculating</source>
        <translation>계산 중</translation>
    </message>
    <message>
        <source>Complete</source>
        <translation>완료</translation>
    </message>
    <message>
        <source>OK to move instrument</source>
        <translation>기기를 움직여도 됩니다</translation>
    </message>
</context>
<context>
    <name>CalibrationReferenceCheckPopup</name>
    <message>
        <source>Measurement Starting</source>
        <translation>측정 시작</translation>
    </message>
    <message>
        <source>Measuring</source>
        <translation>측정 중</translation>
    </message>
</context>
<context>
    <name>CalibrationSensorPopup</name>
    <message>
        <source>Not all pressure sensors are active. Press the OK button to start the calibration when all pressure sensors are active</source>
        <translation>일부 압력 센서가 비활성 상태입니다. 모두 활성화되면 확인을 눌러 교정을 시작하십시오</translation>
    </message>
    <message>
        <source>Incorrect Position</source>
        <translation>위치가 올바르지 않음</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>확인</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>취소</translation>
    </message>
</context>
<context>
    <name>CalibrationStep2PageContents</name>
    <message>
        <source>PLACE ON A FLAT SURFACE</source>
        <translation>평평한 면에 놓기</translation>
    </message>
    <message>
        <source>ALIGN WHITE LINE</source>
        <translation>흰색 선 맞추기</translation>
    </message>
</context>
<context>
    <name>CalibrationStep3PageContents</name>
    <message>
        <source>Tap the calibrate button to start calibration</source>
        <translation>교정 버튼을 눌러 교정을 시작하십시오</translation>
    </message>
    <message>
        <source>Calibrate</source>
        <translation>교정</translation>
    </message>
    <message>
        <source>or</source>
        <translation>또는</translation>
    </message>
    <message>
        <source>Press the measurement button on the instrument</source>
        <translation>기기의 측정 버튼을 누르십시오</translation>
    </message>
</context>
<context>
    <name>CalibrationWizardPage</name>
    <message>
        <source>Step 1</source>
        <translation>1단계</translation>
    </message>
    <message>
        <source>Step %1</source>
        <translation>%1단계</translation>
    </message>
</context>
<context>
    <name>CalibrationWizardPageContainer</name>
    <message>
        <source>Tap the self test button to start self testing</source>
        <translation>자가 진단 버튼을 눌러 자가 진단을 시작하십시오</translation>
    </message>
    <message>
        <source>Self Test</source>
        <translation>자가 진단</translation>
    </message>
    <message>
        <source>Calibrate your instrument by using the white reference tile included with your instrument.</source>
        <translation>기기와 함께 제공된 백색 기준판으로 기기를 교정하십시오.</translation>
    </message>
    <message>
        <source>Serial Number: %1</source>
        <translation>일련 번호: %1</translation>
    </message>
    <message>
        <source>Place the instrument on the white calibration tile by aligning the white line on the desired reference.</source>
        <translation>흰색 선을 원하는 기준에 맞추어 기기를 백색 교정판 위에 올려 놓으십시오.</translation>
    </message>
    <message>
        <source>Verify your instrument by using the effect reference tile included with your instrument. Serial Number: %1</source>
        <translation>기기와 함께 제공된 이펙트 기준판으로 기기를 확인하십시오. 일련 번호: %1</translation>
    </message>
    <message>
        <source>Place the instrument on the effect reference tile by aligning the white line on the desired reference</source>
        <translation>흰색 선을 원하는 기준에 맞추어 기기를 이펙트 기준판 위에 올려 놓으십시오</translation>
    </message>
    <message>
        <source>Self test your instrument by using the white reference tile included with your instrument. Serial Number: %1</source>
        <translation>기기와 함께 제공된 백색 기준판으로 자가 진단을 실행하십시오. 일련 번호: %1</translation>
    </message>
    <message>
        <source>Place the instrument on the white reference tile by aligning the white line on the desired reference</source>
        <translation>흰색 선을 원하는 기준에 맞추어 기기를 백색 기준판 위에 올려 놓으십시오</translation>
    </message>
    <message>
        <source>Self test your instrument by using the effect reference tile included with your instrument. Serial Number: %1</source>
        <translation>기기와 함께 제공된 이펙트 기준판으로 자가 진단을 실행하십시오. 일련 번호: %1</translation>
    </message>
    <message>
        <source>Self test your instrument by lifting the instrument into open air (not placed on anything)</source>
        <translation>기기를 공중에 들어 올려(아무것에도 닿지 않게) 자가 진단을 실행하십시오</translation>
    </message>
</context>
<context>
    <name>CalibrationWizardScreen</name>
    <message>
        <source>Calibration</source>
        <translation>교정</translation>
    </message>
    <message>
        <source>Self Test %1: %2</source>
        <translation>자가 진단 %1: %2</translation>
    </message>
    <message>
        <source>Reference Tile Check</source>
        <translation>기준 타일 확인</translation>
    </message>
</context>
<context>
    <name>DaddyPanel</name>
    <message>
        <source>Warning</source>
        <translation>경고</translation>
    </message>
    <message>
        <source>Reference Check Failed</source>
        <translation>기준 점검 실패</translation>
    </message>
    <message>
        <source>Instrument Is Full</source>
        <translation>기기 메모리 가득 참</translation>
    </message>
    <message>
        <source>There is not enough memory to complete the requested Job. Please remove existing jobs to free up memory.</source>
        <translation>작업을 완료할 메모리가 부족합니다. 기존 작업을 삭제하여 메모리를 확보하십시오.</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>오류</translation>
    </message>
    <message>
        <source>No database entries</source>
        <translation>데이터베이스 항목 없음</translation>
    </message>
    <message>
        <source>Measurement Cancelled</source>
        <translation>측정 취소됨</translation>
    </message>
    <message>
        <source>The instrument was moved during a measurement</source>
        <translation>측정 중에 기기가 움직였습니다</translation>
    </message>
    <message>
        <source>Index invalid</source>
        <translation>잘못된 인덱스</translation>
    </message>
    <message>
        <source>Calibration Error</source>
        <translation>교정 오류</translation>
    </message>
    <message>
        <source>Instrument not on white tile, or internal white dirty</source>
        <translation>기기가 백색 타일 위에 없거나 내부 백색이 오염됨</translation>
    </message>
    <message>
        <source>Calibration data not valid</source>
        <translation>교정 데이터가 유효하지 않음</translation>
    </message>
    <message>
        <source>Not calibrated</source>
        <translation>교정되지 않음</translation>
    </message>
    <message>
        <source>External white tile too dirty or incorrect white tile</source>
        <translation>외부 백색 타일이 너무 더럽거나 잘못된 타일임</translation>
    </message>
    <message>
        <source>Measurement Aborted</source>
        <translation>측정 중단됨</translation>
    </message>
    <message>
        <source>The measurement has been aborted by the user</source>
        <translation>사용자가 측정을 중단했습니다</translation>
    </message>
    <message>
        <source>Battery is low. Charge the battery</source>
        <translation>배터리 부족. 배터리를 충전하십시오</translation>
    </message>
    <message>
        <source>Battery is empty. Instrument will shut down</source>
        <translation>배터리 방전. 기기가 꺼집니다</translation>
    </message>
    <message>
        <source>Error in shutter motor</source>
        <translation>셔터 모터 오류</translation>
    </message>
    <message>
        <source>No stored reference measurement</source>
        <translation>저장된 기준 측정 없음</translation>
    </message>
    <message>
        <source>Spectral integration time on white too long</source>
        <translation>백색 분광 적분 시간이 너무 깁니다</translation>
    </message>
    <message>
        <source>Wavelength shift above absolute limit of 5 nm</source>
        <translation>파장 편이가 절대 한계 5 nm를 초과함</translation>
    </message>
    <message>
        <source>Low Storage</source>
        <translation>저장 공간 부족</translation>
    </message>
    <message>
        <source>Problem occurred changing Wi-Fi modes</source>
        <translation>Wi-Fi 모드 변경 중 문제 발생</translation>
    </message>
    <message>
        <source>Problem occurred scanning for Wi-Fi</source>
        <translation>Wi-Fi 검색 중 문제 발생</translation>
    </message>
    <message>
        <source>Sample temperature too high (IR Sensor)</source>
        <translation>샘플 온도가 너무 높음 (IR 센서)</translation>
    </message>
    <message>
        <source>Sample temperature too low (IR Sensor)</source>
        <translation>샘플 온도가 너무 낮음 (IR 센서)</translation>
    </message>
    <message>
        <source>Battery level is too low for update</source>
        <translation>업데이트하기에 배터리 잔량이 너무 적습니다</translation>
    </message>
    <message>
        <source>Date and time not set</source>
        <translation>날짜와 시간이 설정되지 않음</translation>
    </message>
    <message>
        <source>Problem during initialization. Please reboot the device</source>
        <translation>초기화 중 문제가 발생했습니다. 기기를 재부팅하십시오</translation>
    </message>
    <message>
        <source>Hardware communication error. Please reboot the device</source>
        <translation>하드웨어 통신 오류. 기기를 재부팅하십시오</translation>
    </message>
    <message>
        <source>Error during measurement</source>
        <translation>측정 중 오류</translation>
    </message>
    <message>
        <source>Different best matches for checkpoints</source>
        <translation>체크포인트의 최적 일치가 서로 다름</translation>
    </message>
    <message>
        <source>Calibrating</source>
        <translation>교정 중</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>확인</translation>
    </message>
</context>
<context>
    <name>DeleteAllSamplesPopup</name>
    <message>
        <source>Clear Database</source>
        <translation>데이터베이스 지우기</translation>
    </message>
    <message>
        <source>Are you sure you want to clear the database, this will delete all samples and jobs from the instrument?</source>
        <translation>데이터베이스를 지우시겠습니까? 기기의 모든 샘플과 작업이 삭제됩니다.</translation>
    </message>
</context>
<context>
    <name>DeletePopup</name>
    <message>
        <source>Delete All Samples?</source>
        <translation>모든 샘플을 삭제하시겠습니까?</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>삭제</translation>
    </message>
    <message>
        <source>No</source>
        <translation>아니요</translation>
    </message>
</context>
<context>
    <name>DeleteSamplePopup</name>
    <message>
        <source>Delete Sample?</source>
        <translation>샘플을 삭제하시겠습니까?</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>삭제</translation>
    </message>
    <message>
        <source>No</source>
        <translation>아니요</translation>
    </message>
</context>
<context>
    <name>ImageViewScreen</name>
    <message>
        <source>Camera Images</source>
        <translation>카메라 이미지</translation>
    </message>
</context>
<context>
    <name>JobActionsPopup</name>
    <message>
        <source>Delete Job</source>
        <translation>작업 삭제</translation>
    </message>
    <message>
        <source>View/Edit Job</source>
        <translation>작업 보기/편집</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>취소</translation>
    </message>
    <message>
        <source>Copy Job</source>
        <translation>작업 복사</translation>
    </message>
    <message>
        <source>Send Job To Server</source>
        <translation>작업을 서버로 전송</translation>
    </message>
    <message>
        <source>Execute Job</source>
        <translation>작업 실행</translation>
    </message>
</context>
<context>
    <name>JobFreeTextEditScreen</name>
    <message>
        <source>Notes</source>
        <translation>메모</translation>
    </message>
</context>
<context>
    <name>JobKeypadScreen</name>
    <message>
        <source>OK</source>
        <translation>확인</translation>
    </message>
    <message>
        <source>ABC</source>
        <translation>ABC</translation>
    </message>
    <message>
        <source>Special Keys</source>
        <translation>특수 문자</translation>
    </message>
</context>
<context>
    <name>JobListQuickSelectionItem</name>
    <message>
        <source>Delete All Completed Jobs</source>
        <translation>완료된 작업 모두 삭제</translation>
    </message>
</context>
<context>
    <name>JobListScreen</name>
    <message>
        <source>Jobs</source>
        <translation>작업</translation>
    </message>
    <message>
        <source>+</source>
        <translation>+</translation>
    </message>
    <message>
        <source>Open</source>
        <translation>진행 중</translation>
    </message>
    <message>
        <source>Complete</source>
        <translation>완료</translation>
    </message>
    <message>
        <source>Open (%1)</source>
        <translation>진행 중 (%1)</translation>
    </message>
    <message>
        <source>Complete (%1)</source>
        <translation>완료 (%1)</translation>
    </message>
    <message>
        <source>Delete Job?</source>
        <translation>작업을 삭제하시겠습니까?</translation>
    </message>
    <message>
        <source>The entire job and all samples will be permanently deleted.</source>
        <translation>작업 전체와 모든 샘플이 영구적으로 삭제됩니다.</translation>
    </message>
    <message>
        <source>Delete All Completed Jobs?</source>
        <translation>완료된 작업을 모두 삭제하시겠습니까?</translation>
    </message>
    <message>
        <source>All completed jobs will be permanently deleted.</source>
        <translation>완료된 작업이 모두 영구적으로 삭제됩니다.</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>확인</translation>
    </message>
    <message>
        <source>Instrument Is Full</source>
        <translation>기기 메모리 가득 참</translation>
    </message>
    <message>
        <source>A new job cannot be created until one or more existing jobs are removed from the instrument.</source>
        <translation>기기에서 기존 작업을 하나 이상 삭제해야 새 작업을 만들 수 있습니다.</translation>
    </message>
    <message>
        <source>There is not enough memory to complete the requested Job. Please remove existing jobs to free up memory.</source>
        <translation>작업을 완료할 메모리가 부족합니다. 기존 작업을 삭제하여 메모리를 확보하십시오.</translation>
    </message>
</context>
<context>
    <name>JobMeasureScreen</name>
    <message>
        <source>Summary</source>
        <translation>요약</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>삭제</translation>
    </message>
    <message>
        <source>Measure</source>
        <translation>측정</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>저장</translation>
    </message>
    <message>
        <source>Job Details</source>
        <translation>작업 세부 정보</translation>
    </message>
    <message>
        <source>Name:</source>
        <translation>이름:</translation>
    </message>
    <message>
        <source>%1:</source>
        <translation>%1:</translation>
    </message>
    <message>
        <source>Notes:</source>
        <translation>메모:</translation>
    </message>
    <message>
        <source>Send Job To Server</source>
        <translation>작업을 서버로 전송</translation>
    </message>
    <message>
        <source>SMC Results</source>
        <translation>SMC 결과</translation>
    </message>
    <message>
        <source>Average Results</source>
        <translation>평균 결과</translation>
    </message>
    <message>
        <source>Measurements</source>
        <translation>측정값</translation>
    </message>
    <message>
        <source>%1 of %2 completed</source>
        <translation>%2개 중 %1개 완료</translation>
    </message>
    <message>
        <source>Delete Job?</source>
        <translation>작업을 삭제하시겠습니까?</translation>
    </message>
    <message>
        <source>The entire job and all samples will be permanently deleted.</source>
        <translation>작업 전체와 모든 샘플이 영구적으로 삭제됩니다.</translation>
    </message>
    <message>
        <source>Warning</source>
        <translation>경고</translation>
    </message>
    <message>
        <source>This job was not created on the instrument. Are you sure you want to edit the job?</source>
        <translation>이 작업은 기기에서 생성되지 않았습니다. 작업을 편집하시겠습니까?</translation>
    </message>
    <message>
        <source>Edit</source>
        <translation>편집</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>취소</translation>
    </message>
</context>
<context>
    <name>JobNameEditScreen</name>
    <message>
        <source>Name</source>
        <translation>이름</translation>
    </message>
    <message>
        <source>Job Name cannot be empty</source>
        <translation>작업 이름을 비워 둘 수 없습니다</translation>
    </message>
    <message>
        <source>Enter a unique job name that is not empty</source>
        <translation>비어 있지 않은 고유한 작업 이름을 입력하십시오</translation>
    </message>
    <message>
        <source>Job Name Already Exists</source>
        <translation>이미 있는 작업 이름</translation>
    </message>
    <message>
        <source>This job name already exists.  Please change the name to a unique name</source>
        <translation>이미 있는 작업 이름입니다. 고유한 이름으로 바꾸십시오</translation>
    </message>
</context>
<context>
    <name>JobTagEditScreen</name>
    <message>
        <source>Tag Name Does Not Exist</source>
        <translation>태그 이름이 없습니다</translation>
    </message>
    <message>
        <source>This tag name does not exist. Please change the name to an existing tag name</source>
        <translation>없는 태그 이름입니다. 기존 태그 이름으로 바꾸십시오</translation>
    </message>
</context>
<context>
    <name>Keypad</name>
    <message>
        <source>123</source>
        <translation>123</translation>
    </message>
    <message>
        <source>ABC</source>
        <translation>ABC</translation>
    </message>
</context>
<context>
    <name>LockScreen</name>
    <message>
        <source>Instrument Locked</source>
        <translation>기기 잠김</translation>
    </message>
</context>
<context>
    <name>MeasuringPopup</name>
    <message>
        <source>Measuring</source>
        <translation>측정 중</translation>
    </message>
    <message>
        <source>Hold Steady</source>
        <translation>움직이지 마십시오</translation>
    </message>
    <message>
        <source>Do not touch or bump instrument</source>
        <translation>기기를 만지거나 부딪히지 마십시오</translation>
    </message>
    <message>
        <source>Calculating</source>
        <translation>계산 중</translation>
    </message>
    <message>
        <source>OK to move instrument</source>
        <translation>기기를 움직여도 됩니다</translation>
    </message>
</context>
<context>
    <name>PowerDownPopup</name>
    <message>
        <source>Power Off</source>
        <translation>전원 끄기</translation>
    </message>
    <message>
        <source>Reboot</source>
        <translation>재부팅</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>취소</translation>
    </message>
</context>
<context>
    <name>RestoreFactorySettingsPopup</name>
    <message>
        <source>Confirm by moving the dot around the circle</source>
        <translation>점을 원을 따라 한 바퀴 돌려 확인하세요</translation>
    </message>
    <message>
        <source>Restore Factory Settings</source>
        <translation>공장 설정 복원</translation>
    </message>
    <message>
        <source>All current user settings will go back to defaults. Any jobs or samples will also be lost!</source>
        <translation>모든 설정이 기본값으로 돌아갑니다. 작업과 샘플도 모두 삭제됩니다!</translation>
    </message>
</context>
<context>
    <name>SadPuppyScreen</name>
    <message>
        <source>Error</source>
        <translation>오류</translation>
    </message>
    <message>
        <source>An error has occurred, please reboot the instrument</source>
        <translation>오류가 발생했습니다. 기기를 재부팅하십시오</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>확인</translation>
    </message>
</context>
<context>
    <name>SampleDetailsViewer</name>
    <message>
        <source>Color View</source>
        <translation>색상 보기</translation>
    </message>
</context>
<context>
    <name>SampleDetailsViewerD15</name>
    <message>
        <source>15%1 Series</source>
        <translation>15%1 시리즈</translation>
    </message>
</context>
<context>
    <name>SampleDetailsViewerD45</name>
    <message>
        <source>45%1 Series</source>
        <translation>45%1 시리즈</translation>
    </message>
</context>
<context>
    <name>SampleDetailsViewerTexture</name>
    <message>
        <source>15%1 Texture</source>
        <translation>15%1 텍스처</translation>
    </message>
</context>
<context>
    <name>SampleListSelectionItemComplete</name>
    <message>
        <source>More measurements are needed to complete this job</source>
        <translation>이 작업을 완료하려면 측정이 더 필요합니다</translation>
    </message>
</context>
<context>
    <name>SampleResultsPage</name>
    <message>
        <source>Measurement</source>
        <translation>측정</translation>
    </message>
    <message>
        <source>Camera Images</source>
        <translation>카메라 이미지</translation>
    </message>
</context>
<context>
    <name>SampleViewScreen</name>
    <message>
        <source>Details</source>
        <translation>세부 정보</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>삭제</translation>
    </message>
</context>
<context>
    <name>SelfTestListItem</name>
    <message>
        <source>Pass</source>
        <translation>통과</translation>
    </message>
    <message>
        <source>Fail</source>
        <translation>실패</translation>
    </message>
    <message>
        <source>Canceled</source>
        <translation>취소됨</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>오류</translation>
    </message>
</context>
<context>
    <name>SelfTestPopup</name>
    <message>
        <source>Hold the instrument in open air</source>
        <translation>기기를 공중에 들고 계십시오</translation>
    </message>
    <message>
        <source>Do not touch or bump instrument</source>
        <translation>기기를 만지거나 부딪히지 마십시오</translation>
    </message>
    <message>
        <source>Complete</source>
        <translation>완료</translation>
    </message>
</context>
<context>
    <name>SelfTestScreen</name>
    <message>
        <source>Self Test</source>
        <translation>자가 진단</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>확인</translation>
    </message>
    <message>
        <source>White Calibration</source>
        <translation>흰색 교정</translation>
    </message>
    <message>
        <source>Reference check on white</source>
        <translation>흰색 기준 확인</translation>
    </message>
    <message>
        <source>Effect tile test</source>
        <translation>이펙트 타일 테스트</translation>
    </message>
    <message>
        <source>Repeatability tests</source>
        <translation>반복성 테스트</translation>
    </message>
    <message>
        <source>Temperature tests</source>
        <translation>온도 테스트</translation>
    </message>
    <message>
        <source>Pressure sensor test</source>
        <translation>압력 센서 테스트</translation>
    </message>
    <message>
        <source>Check error logs</source>
        <translation>오류 로그 확인</translation>
    </message>
    <message>
        <source>Testing...</source>
        <translation>진단 중...</translation>
    </message>
    <message>
        <source>All Tests Complete</source>
        <translation>모든 진단 완료</translation>
    </message>
    <message>
        <source>Self Tests Canceled</source>
        <translation>자가 진단 취소됨</translation>
    </message>
</context>
<context>
    <name>SettingsDatabaseMemoryPage</name>
    <message>
        <source>Database / Memory</source>
        <translation>데이터베이스 / 메모리</translation>
    </message>
    <message>
        <source>Samples</source>
        <translation>샘플</translation>
    </message>
    <message>
        <source>Jobs</source>
        <translation>작업</translation>
    </message>
    <message>
        <source>Clear Database</source>
        <translation>데이터베이스 지우기</translation>
    </message>
</context>
<context>
    <name>SettingsDirectoryExplorerPage</name>
    <message>
        <source>No files</source>
        <translation>파일 없음</translation>
    </message>
</context>
<context>
    <name>SettingsDisplayPage</name>
    <message>
        <source>Display Settings</source>
        <translation>디스플레이 설정</translation>
    </message>
    <message>
        <source>Display Brightness</source>
        <translation>화면 밝기</translation>
    </message>
</context>
<context>
    <name>SettingsFileViewerPage</name>
    <message>
        <source>The file can&apos;t be shown.</source>
        <translation>파일을 표시할 수 없습니다.</translation>
    </message>
    <message>
        <source>The file can&apos;t be read.</source>
        <translation>파일을 읽을 수 없습니다.</translation>
    </message>
</context>
<context>
    <name>SettingsLanguagePage</name>
    <message>
        <source>Language</source>
        <translation>언어</translation>
    </message>
</context>
<context>
    <name>SettingsLegalInformationPage</name>
    <message>
        <source>Legal Information</source>
        <translation>법적 정보</translation>
    </message>
</context>
<context>
    <name>SettingsListSelectionPowerInfo</name>
    <message>
        <source>%1 hour </source>
        <translation>%1시간 </translation>
    </message>
    <message>
        <source>%1 hours </source>
        <translation>%1시간 </translation>
    </message>
    <message>
        <source>%1 minutes and </source>
        <translation>%1분 </translation>
    </message>
    <message>
        <source>%1 seconds</source>
        <translation>%1초</translation>
    </message>
    <message>
        <source>Never</source>
        <translation>안 함</translation>
    </message>
    <message>
        <source>Display dims after: %1
Standby after: %2
Power off after: %3</source>
        <translation>화면 어둡게: %1 후
대기: %2 후
전원 끄기: %3 후</translation>
    </message>
</context>
<context>
    <name>SettingsListSelectionProgressItem</name>
    <message>
        <source>%1%</source>
        <translation>%1%</translation>
    </message>
    <message>
        <source>%1 of %2</source>
        <translation>%1 / %2</translation>
    </message>
</context>
<context>
    <name>SettingsListSelectionSliderItem</name>
    <message>
        <source>Never</source>
        <translation>안 함</translation>
    </message>
</context>
<context>
    <name>SettingsMainPage</name>
    <message>
        <source>Settings</source>
        <translation>설정</translation>
    </message>
    <message>
        <source>Valid</source>
        <translation>유효</translation>
    </message>
    <message>
        <source>Expired</source>
        <translation>만료됨</translation>
    </message>
    <message>
        <source>Not Connected</source>
        <translation>연결 안 됨</translation>
    </message>
    <message>
        <source>%1</source>
        <translation>%1</translation>
    </message>
    <message>
        <source>%1%</source>
        <translation>%1%</translation>
    </message>
    <message>
        <source>Power</source>
        <translation>전원</translation>
    </message>
    <message>
        <source>Language</source>
        <translation>언어</translation>
    </message>
    <message>
        <source>Calibration</source>
        <translation>교정</translation>
    </message>
    <message>
        <source>Measurement Options</source>
        <translation>측정 옵션</translation>
    </message>
    <message>
        <source>Wi-Fi</source>
        <translation>Wi-Fi</translation>
    </message>
    <message>
        <source>Display Settings</source>
        <translation>디스플레이 설정</translation>
    </message>
    <message>
        <source>Beeper Volume</source>
        <translation>신호음 볼륨</translation>
    </message>
    <message>
        <source>Power Saving Options</source>
        <translation>절전 옵션</translation>
    </message>
    <message>
        <source>System &amp; Diagnostics</source>
        <translation>시스템 및 진단</translation>
    </message>
</context>
<context>
    <name>SettingsMeasurementPage</name>
    <message>
        <source>On</source>
        <translation>켜짐</translation>
    </message>
    <message>
        <source>Off</source>
        <translation>꺼짐</translation>
    </message>
    <message>
        <source>Measurement Options</source>
        <translation>측정 옵션</translation>
    </message>
    <message>
        <source>Auto Measurement</source>
        <translation>자동 측정</translation>
    </message>
    <message>
        <source>Time to start auto measurement (sec):</source>
        <translation>자동 측정 시작까지 시간(초):</translation>
    </message>
    <message>
        <source>Measurement Mode</source>
        <translation>측정 모드</translation>
    </message>
    <message>
        <source>No. of good measurements required:</source>
        <translation>필요한 양호 측정 수:</translation>
    </message>
    <message>
        <source>Maximum measurements:</source>
        <translation>최대 측정 수:</translation>
    </message>
    <message>
        <source>Auto Measurements: %1</source>
        <translation>자동 측정: %1</translation>
    </message>
    <message>
        <source>Display LABCH: %1</source>
        <translation>LABCH 표시: %1</translation>
    </message>
    <message>
        <source>Override Pressure Sensors: %1</source>
        <translation>압력 센서 무시: %1</translation>
    </message>
</context>
<context>
    <name>SettingsPowerOptionsPage</name>
    <message>
        <source>Power Saving
Options</source>
        <translation>절전
옵션</translation>
    </message>
    <message>
        <source>Dim Display</source>
        <translation>화면 어둡게</translation>
    </message>
    <message>
        <source>Standby Mode</source>
        <translation>대기 모드</translation>
    </message>
    <message>
        <source>Power Off</source>
        <translation>전원 끄기</translation>
    </message>
    <message>
        <source>Seconds until display dims:</source>
        <translation>화면이 어두워질 때까지 초:</translation>
    </message>
    <message>
        <source>Minutes until standby mode:</source>
        <translation>대기 모드까지 분:</translation>
    </message>
    <message>
        <source>Minutes until power off:</source>
        <translation>전원 꺼짐까지 분:</translation>
    </message>
</context>
<context>
    <name>SettingsPowerPage</name>
    <message>
        <source>Power</source>
        <translation>전원</translation>
    </message>
    <message>
        <source>Power Off</source>
        <translation>전원 끄기</translation>
    </message>
    <message>
        <source>Reboot</source>
        <translation>재시작</translation>
    </message>
    <message>
        <source>Shutdown Instrument?</source>
        <translation>기기를 끄시겠습니까?</translation>
    </message>
    <message>
        <source>Are you sure you want to shutdown the instrument?</source>
        <translation>기기를 끄시겠습니까?</translation>
    </message>
    <message>
        <source>Enter Standby Mode?</source>
        <translation>대기 모드로 전환하시겠습니까?</translation>
    </message>
    <message>
        <source>Are you sure you want to put the instrument into standby mode?</source>
        <translation>기기를 대기 모드로 전환하시겠습니까?</translation>
    </message>
    <message>
        <source>Reboot Instrument?</source>
        <translation>기기를 재시작하시겠습니까?</translation>
    </message>
    <message>
        <source>Are you sure you want to reboot the instrument?</source>
        <translation>기기를 재시작하시겠습니까?</translation>
    </message>
    <message>
        <source>Yes</source>
        <translation>예</translation>
    </message>
    <message>
        <source>No</source>
        <translation>아니요</translation>
    </message>
</context>
<context>
    <name>SettingsSystemAndDiagnosticsPage</name>
    <message>
        <source>System &amp;
Diagnostics</source>
        <translation>시스템 및
진단</translation>
    </message>
    <message>
        <source>System Information</source>
        <translation>시스템 정보</translation>
    </message>
    <message>
        <source>Database / Memory</source>
        <translation>데이터베이스 / 메모리</translation>
    </message>
    <message>
        <source>Legal Information</source>
        <translation>법적 정보</translation>
    </message>
    <message>
        <source>Self Test</source>
        <translation>자체 테스트</translation>
    </message>
</context>
<context>
    <name>SettingsSystemInformationPage</name>
    <message>
        <source>System Information</source>
        <translation>시스템 정보</translation>
    </message>
    <message>
        <source>Not Configured</source>
        <translation>설정되지 않음</translation>
    </message>
    <message>
        <source>Instrument Model:</source>
        <translation>모델:</translation>
    </message>
    <message>
        <source>Instrument Serial:</source>
        <translation>일련번호:</translation>
    </message>
    <message>
        <source>Part Number:</source>
        <translation>부품 번호:</translation>
    </message>
    <message>
        <source>White Reference Tile:</source>
        <translation>백색 기준판:</translation>
    </message>
    <message>
        <source>Certification Date:</source>
        <translation>인증 날짜:</translation>
    </message>
    <message>
        <source>Firmware Revision:</source>
        <translation>펌웨어 버전:</translation>
    </message>
    <message>
        <source>Interface Revision:</source>
        <translation>인터페이스 버전:</translation>
    </message>
    <message>
        <source>Kernel:</source>
        <translation>커널:</translation>
    </message>
    <message>
        <source>Bootloader:</source>
        <translation>부트로더:</translation>
    </message>
    <message>
        <source>Server URL:</source>
        <translation>서버 URL:</translation>
    </message>
    <message>
        <source>Restore Factory Settings</source>
        <translation>공장 설정 복원</translation>
    </message>
    <message>
        <source>Open Source</source>
        <translation>오픈 소스</translation>
    </message>
    <message>
        <source>Burn in BIRCH JuniperX/Juniper</source>
        <translation>Burn in BIRCH JuniperX/Juniper</translation>
    </message>
    <message>
        <source>Burn in ALDER Larch</source>
        <translation>Burn in ALDER Larch</translation>
    </message>
    <message>
        <source>Burn in Spruce / Sequoia</source>
        <translation>Burn in Spruce / Sequoia</translation>
    </message>
</context>
<context>
    <name>SettingsVolumePage</name>
    <message>
        <source>Beeper Volume</source>
        <translation>신호음 볼륨</translation>
    </message>
</context>
<context>
    <name>SettingsWifiPage</name>
    <message>
        <source>Wi-Fi</source>
        <translation>Wi-Fi</translation>
    </message>
    <message>
        <source>On</source>
        <translation>켜짐</translation>
    </message>
    <message>
        <source>Off</source>
        <translation>꺼짐</translation>
    </message>
    <message>
        <source>Static IP</source>
        <translation>고정 IP</translation>
    </message>
    <message>
        <source>DHCP</source>
        <translation>DHCP</translation>
    </message>
    <message>
        <source>Known Networks</source>
        <translation>알려진 네트워크</translation>
    </message>
    <message>
        <source>Unknown Networks</source>
        <translation>사용 가능한 네트워크</translation>
    </message>
    <message>
        <source>Connection Issue</source>
        <translation>연결 문제</translation>
    </message>
    <message>
        <source>Incorrect password</source>
        <translation>비밀번호가 올바르지 않습니다</translation>
    </message>
    <message>
        <source>Network not in range</source>
        <translation>네트워크가 범위를 벗어났습니다</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>확인</translation>
    </message>
</context>
<context>
    <name>StringTables</name>
    <message>
        <source>English</source>
        <translation>영어</translation>
    </message>
    <message>
        <source>Spanish</source>
        <translation>스페인어</translation>
    </message>
    <message>
        <source>French</source>
        <translation>프랑스어</translation>
    </message>
    <message>
        <source>German</source>
        <translation>독일어</translation>
    </message>
    <message>
        <source>Italian</source>
        <translation>이탈리아어</translation>
    </message>
    <message>
        <source>Portuguese</source>
        <translation>포르투갈어</translation>
    </message>
    <message>
        <source>Japanese</source>
        <translation>일본어</translation>
    </message>
    <message>
        <source>Korean</source>
        <translation>한국어</translation>
    </message>
    <message>
        <source>Chinese Simplified</source>
        <translation>중국어 간체</translation>
    </message>
    <message>
        <source>Custom</source>
        <translation>사용자 지정</translation>
    </message>
    <message>
        <source>-45%1</source>
        <translation>-45%1</translation>
    </message>
    <message>
        <source>-15%1</source>
        <translation>-15%1</translation>
    </message>
    <message>
        <source>15%1</source>
        <translation>15%1</translation>
    </message>
    <message>
        <source>45%1</source>
        <translation>45%1</translation>
    </message>
    <message>
        <source>80%1</source>
        <translation>80%1</translation>
    </message>
    <message>
        <source>Diffuse</source>
        <translation>확산</translation>
    </message>
    <message>
        <source>25%1</source>
        <translation>25%1</translation>
    </message>
    <message>
        <source>75%1</source>
        <translation>75%1</translation>
    </message>
    <message>
        <source>110%1</source>
        <translation>110%1</translation>
    </message>
    <message>
        <source>A/2%1</source>
        <translation>A/2%1</translation>
    </message>
    <message>
        <source>A/10%1</source>
        <translation>A/10%1</translation>
    </message>
    <message>
        <source>C/2%1</source>
        <translation>C/2%1</translation>
    </message>
    <message>
        <source>C/10%1</source>
        <translation>C/10%1</translation>
    </message>
    <message>
        <source>D50/2%1</source>
        <translation>D50/2%1</translation>
    </message>
    <message>
        <source>D50/10%1</source>
        <translation>D50/10%1</translation>
    </message>
    <message>
        <source>D55/2%1</source>
        <translation>D55/2%1</translation>
    </message>
    <message>
        <source>D55/10%1</source>
        <translation>D55/10%1</translation>
    </message>
    <message>
        <source>D65/2%1</source>
        <translation>D65/2%1</translation>
    </message>
    <message>
        <source>D65/10%1</source>
        <translation>D65/10%1</translation>
    </message>
    <message>
        <source>D75/2%1</source>
        <translation>D75/2%1</translation>
    </message>
    <message>
        <source>D75/10%1</source>
        <translation>D75/10%1</translation>
    </message>
    <message>
        <source>F2/2%1</source>
        <translation>F2/2%1</translation>
    </message>
    <message>
        <source>F2/10%1</source>
        <translation>F2/10%1</translation>
    </message>
    <message>
        <source>F7/2%1</source>
        <translation>F7/2%1</translation>
    </message>
    <message>
        <source>F7/10%1</source>
        <translation>F7/10%1</translation>
    </message>
    <message>
        <source>F8/2%1</source>
        <translation>F8/2%1</translation>
    </message>
    <message>
        <source>F8/10%1</source>
        <translation>F8/10%1</translation>
    </message>
    <message>
        <source>F10/2%1</source>
        <translation>F10/2%1</translation>
    </message>
    <message>
        <source>F10/10%1</source>
        <translation>F10/10%1</translation>
    </message>
    <message>
        <source>F11/2%1</source>
        <translation>F11/2%1</translation>
    </message>
    <message>
        <source>F11/10%1</source>
        <translation>F11/10%1</translation>
    </message>
    <message>
        <source>F12/2%1</source>
        <translation>F12/2%1</translation>
    </message>
    <message>
        <source>F12/10%1</source>
        <translation>F12/10%1</translation>
    </message>
    <message>
        <source>Mid Tier</source>
        <translation>중급형</translation>
    </message>
    <message>
        <source>ALDER</source>
        <translation>ALDER</translation>
    </message>
    <message>
        <source>BIRCH</source>
        <translation>BIRCH</translation>
    </message>
    <message>
        <source>QC</source>
        <translation>QC</translation>
    </message>
    <message>
        <source>No Averaging</source>
        <translation>평균 없음</translation>
    </message>
    <message>
        <source>Averaging 3</source>
        <translation>3회 평균</translation>
    </message>
    <message>
        <source>Averaging 5</source>
        <translation>5회 평균</translation>
    </message>
    <message>
        <source>SMC m:n</source>
        <translation>SMC m:n</translation>
    </message>
    <message>
        <source>White Tile</source>
        <translation>백색 타일</translation>
    </message>
    <message>
        <source>Reference Tile</source>
        <translation>기준 타일</translation>
    </message>
    <message>
        <source>Lifted</source>
        <translation>들어 올림</translation>
    </message>
    <message>
        <source>White Tile Complete</source>
        <translation>백색 타일 완료</translation>
    </message>
    <message>
        <source>Reference Tile Complete</source>
        <translation>기준 타일 완료</translation>
    </message>
    <message>
        <source>Lifted Complete</source>
        <translation>들어 올림 완료</translation>
    </message>
</context>
<context>
    <name>SyncScreen</name>
    <message>
        <source>Syncing Job Data</source>
        <translation>작업 데이터 동기화 중</translation>
    </message>
</context>
<context>
    <name>TargetingScreen</name>
    <message>
        <source>Job</source>
        <translation>작업</translation>
    </message>
    <message>
        <source>Press button to measure.</source>
        <translation>버튼을 눌러 측정하십시오.</translation>
    </message>
    <message>
        <source>Targeting</source>
        <translation>위치 맞춤</translation>
    </message>
    <message>
        <source>Averaged 0 of SMC 0:0</source>
        <translation>평균 0 / SMC 0:0</translation>
    </message>
    <message>
        <source>Measure</source>
        <translation>측정</translation>
    </message>
    <message>
        <source>Terminate</source>
        <translation>종료</translation>
    </message>
    <message>
        <source>Online Mode</source>
        <translation>온라인 모드</translation>
    </message>
    <message>
        <source>Averaged %1 of SMC %2:%3</source>
        <translation>평균 %1 / SMC %2:%3</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>확인</translation>
    </message>
    <message>
        <source>Exit Online Mode?</source>
        <translation>온라인 모드를 종료하시겠습니까?</translation>
    </message>
    <message>
        <source>Exiting online mode will stop targeting and return to the job list.</source>
        <translation>온라인 모드를 종료하면 위치 맞춤을 멈추고 작업 목록으로 돌아갑니다.</translation>
    </message>
    <message>
        <source>Exit</source>
        <translation>종료</translation>
    </message>
    <message>
        <source>Stop Measuring?</source>
        <translation>측정을 중지하시겠습니까?</translation>
    </message>
    <message>
        <source>All measured samples and this job will be permanently deleted.</source>
        <translation>측정한 모든 샘플과 이 작업이 영구히 삭제됩니다.</translation>
    </message>
    <message>
        <source>All measured samples from this job will be permanently deleted.</source>
        <translation>이 작업에서 측정한 모든 샘플이 영구히 삭제됩니다.</translation>
    </message>
    <message>
        <source>Warning</source>
        <translation>경고</translation>
    </message>
    <message>
        <source>Continue</source>
        <translation>계속</translation>
    </message>
    <message>
        <source>Temperature out of range.  Continue online mode until complete, or Exit online mode and return to the job list?</source>
        <translation>온도가 범위를 벗어났습니다. 완료될 때까지 온라인 모드를 계속하시겠습니까, 아니면 온라인 모드를 종료하고 작업 목록으로 돌아가시겠습니까?</translation>
    </message>
    <message>
        <source>Temperature out of range.  Continue job until complete, or delete job and all samples and return to the job list?</source>
        <translation>온도가 범위를 벗어났습니다. 완료될 때까지 작업을 계속하시겠습니까, 아니면 작업과 모든 샘플을 삭제하고 목록으로 돌아가시겠습니까?</translation>
    </message>
    <message>
        <source>Temperature out of range.  Continue job until complete, or delete all samples and return to the job list?</source>
        <translation>온도가 범위를 벗어났습니다. 완료될 때까지 작업을 계속하시겠습니까, 아니면 모든 샘플을 삭제하고 목록으로 돌아가시겠습니까?</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>삭제</translation>
    </message>
    <message>
        <source>Override Pressure Sensors?</source>
        <translation>압력 센서를 무시하시겠습니까?</translation>
    </message>
    <message>
        <source>Not all pressure sensors are active. Press the measure button again to start a measurement, otherwise press the cancel button to return to targeting mode.</source>
        <translation>일부 압력 센서가 활성화되지 않았습니다. 측정하려면 측정 버튼을 다시 누르고, 위치 맞춤으로 돌아가려면 취소를 누르십시오.</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>취소</translation>
    </message>
    <message>
        <source>Information</source>
        <translation>안내</translation>
    </message>
    <message>
        <source>Not all pressure sensors are active. Please ensure all pressure sensors are active before measuring</source>
        <translation>일부 압력 센서가 활성화되지 않았습니다. 측정하기 전에 모든 압력 센서가 활성화되었는지 확인하십시오</translation>
    </message>
    <message>
        <source>Continue Measuring?</source>
        <translation>측정을 계속하시겠습니까?</translation>
    </message>
    <message>
        <source>To continue with measurements, press OK</source>
        <translation>측정을 계속하려면 확인을 누르십시오</translation>
    </message>
    <message>
        <source>Job Time Elapsed</source>
        <translation>작업 시간 초과</translation>
    </message>
    <message>
        <source>The job wasn&apos;t completed within the allocated time</source>
        <translation>작업이 할당된 시간 내에 완료되지 않았습니다</translation>
    </message>
    <message>
        <source>SMC force finished, all readings averaged for result.</source>
        <translation>SMC를 강제 종료했습니다. 모든 측정값의 평균이 결과입니다.</translation>
    </message>
    <message>
        <source>Maximum number of SMC measurements used for this job</source>
        <translation>이 작업의 SMC 측정 횟수가 최대에 도달했습니다</translation>
    </message>
    <message>
        <source>Complete</source>
        <translation>완료</translation>
    </message>
    <message>
        <source>The job has completed.  Press OK to exit online mode</source>
        <translation>작업이 완료되었습니다. 확인을 눌러 온라인 모드를 종료하십시오</translation>
    </message>
    <message>
        <source>SMC force finished, all readings averaged for result.  Press OK to exit online mode</source>
        <translation>SMC를 강제 종료하고 모든 측정값을 평균했습니다. 확인을 눌러 온라인 모드를 종료하십시오</translation>
    </message>
    <message>
        <source>SMC failed after maximum measurements %1, the final results are averaged.  Press OK to exit online mode</source>
        <translation>최대 %1회 측정 후 SMC에 실패하여 최종 결과는 평균값입니다. 확인을 눌러 온라인 모드를 종료하십시오</translation>
    </message>
</context>
<context>
    <name>TerminateJobPopup</name>
    <message>
        <source>Store Average</source>
        <translation>평균 저장</translation>
    </message>
    <message>
        <source>Restart Job</source>
        <translation>작업 다시 시작</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>취소</translation>
    </message>
</context>
<context>
    <name>UndoPopup</name>
    <message>
        <source>Undo</source>
        <translation>실행 취소</translation>
    </message>
    <message>
        <source>Back</source>
        <translation>뒤로</translation>
    </message>
</context>
<context>
    <name>WebSyncButton</name>
    <message>
        <source>Send All Jobs To Server</source>
        <translation>모든 작업을 서버로 전송</translation>
    </message>
</context>
<context>
    <name>WifiPasswordScreen</name>
    <message>
        <source>Password</source>
        <translation>비밀번호</translation>
    </message>
    <message>
        <source>ABC</source>
        <translation>ABC</translation>
    </message>
    <message>
        <source>@&amp;*</source>
        <translation>@&amp;*</translation>
    </message>
</context>
</TS>
