<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="ja_JP">
<context>
    <name>CalibrationNeededPopup</name>
    <message>
        <source>Calibration Required</source>
        <translation>校正が必要です</translation>
    </message>
    <message>
        <source>New measurements cannot be made until the instrument is calibrated. Press Calibrate to start the calibration sequence.</source>
        <translation>機器を校正するまで新しい測定はできません。「校正」を押して校正を開始してください。</translation>
    </message>
    <message>
        <source>Ignore</source>
        <translation>無視</translation>
    </message>
    <message>
        <source>Calibrate</source>
        <translation>校正</translation>
    </message>
    <message>
        <source>Calibration needed within %1 %2</source>
        <translation>%1 %2以内に校正が必要です</translation>
    </message>
    <message>
        <source>seconds</source>
        <translation>秒</translation>
    </message>
    <message>
        <source>minutes</source>
        <translation>分</translation>
    </message>
    <message>
        <source>hours</source>
        <translation>時間</translation>
    </message>
    <message>
        <source>days</source>
        <translation>日</translation>
    </message>
</context>
<context>
    <name>CalibrationPopup</name>
    <message>
        <source>Calibration Starting</source>
        <translation>校正を開始します</translation>
    </message>
    <message>
        <source>Calibrating</source>
        <translation>校正中</translation>
    </message>
    <message>
        <source>Do not touch or bump instrument</source>
        <translation>機器に触れたりぶつけたりしないでください</translation>
    </message>
    <message>
        <source>Calculating</source>
        <translation>計算中</translation>
    </message>
    <message>
        <source>Complete</source>
        <translation>完了</translation>
    </message>
    <message>
        <source>OK to move instrument</source>
        <translation>機器を動かしてもかまいません</translation>
    </message>
</context>
<context>
    <name>CalibrationReferenceCheckPopup</name>
    <message>
        <source>Measurement Starting</source>
        <translation>測定を開始します</translation>
    </message>
    <message>
        <source>Measuring</source>
        <translation>測定中</translation>
    </message>
</context>
<context>
    <name>CalibrationSensorPopup</name>
    <message>
        <source>Not all pressure sensors are active. Press the OK button to start the calibration when all pressure sensors are active</source>
        <translation>反応していない圧力センサーがあります。すべて反応したら OK で校正を開始してください</translation>
    </message>
    <message>
        <source>Incorrect Position</source>
        <translation>位置が正しくありません</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>キャンセル</translation>
    </message>
</context>
<context>
    <name>CalibrationStep2PageContents</name>
    <message>
        <source>PLACE ON A FLAT SURFACE</source>
        <translation>平らな面に置く</translation>
    </message>
    <message>
        <source>ALIGN WHITE LINE</source>
        <translation>白線を合わせる</translation>
    </message>
</context>
<context>
    <name>CalibrationStep3PageContents</name>
    <message>
        <source>Tap the calibrate button to start calibration</source>
        <translation>校正ボタンをタップして校正を開始します</translation>
    </message>
    <message>
        <source>Calibrate</source>
        <translation>校正</translation>
    </message>
    <message>
        <source>or</source>
        <translation>または</translation>
    </message>
    <message>
        <source>Press the measurement button on the instrument</source>
        <translation>機器の測定ボタンを押します</translation>
    </message>
</context>
<context>
    <name>CalibrationWizardPage</name>
    <message>
        <source>Step 1</source>
        <translation>ステップ 1</translation>
    </message>
    <message>
        <source>Step %1</source>
        <translation>ステップ %1</translation>
    </message>
</context>
<context>
    <name>CalibrationWizardPageContainer</name>
    <message>
        <source>Tap the self test button to start self testing</source>
        <translation>自己診断ボタンをタップして自己診断を開始します</translation>
    </message>
    <message>
        <source>Self Test</source>
        <translation>自己診断</translation>
    </message>
    <message>
        <source>Calibrate your instrument by using the white reference tile included with your instrument.</source>
        <translation>付属の白色校正板で機器を校正してください。</translation>
    </message>
    <message>
        <source>Serial Number: %1</source>
        <translation>シリアル番号: %1</translation>
    </message>
    <message>
        <source>Place the instrument on the white calibration tile by aligning the white line on the desired reference.</source>
        <translation>白線を目的の基準に合わせて、機器を白色校正板の上に置いてください。</translation>
    </message>
    <message>
        <source>Verify your instrument by using the effect reference tile included with your instrument. Serial Number: %1</source>
        <translation>付属のエフェクト基準板で機器を確認してください。シリアル番号: %1</translation>
    </message>
    <message>
        <source>Place the instrument on the effect reference tile by aligning the white line on the desired reference</source>
        <translation>白線を目的の基準に合わせて、機器をエフェクト基準板の上に置いてください</translation>
    </message>
    <message>
        <source>Self test your instrument by using the white reference tile included with your instrument. Serial Number: %1</source>
        <translation>付属の白色校正板で機器の自己診断を行います。シリアル番号: %1</translation>
    </message>
    <message>
        <source>Place the instrument on the white reference tile by aligning the white line on the desired reference</source>
        <translation>白線を目的の基準に合わせて、機器を白色校正板の上に置いてください</translation>
    </message>
    <message>
        <source>Self test your instrument by using the effect reference tile included with your instrument. Serial Number: %1</source>
        <translation>付属のエフェクト基準板で機器の自己診断を行います。シリアル番号: %1</translation>
    </message>
    <message>
        <source>Self test your instrument by lifting the instrument into open air (not placed on anything)</source>
        <translation>機器を空中に持ち上げて（何にも触れない状態で）自己診断を行います</translation>
    </message>
</context>
<context>
    <name>CalibrationWizardScreen</name>
    <message>
        <source>Calibration</source>
        <translation>校正</translation>
    </message>
    <message>
        <source>Self Test %1: %2</source>
        <translation>自己診断 %1: %2</translation>
    </message>
    <message>
        <source>Reference Tile Check</source>
        <translation>基準タイル確認</translation>
    </message>
</context>
<context>
    <name>DaddyPanel</name>
    <message>
        <source>Warning</source>
        <translation>警告</translation>
    </message>
    <message>
        <source>Reference Check Failed</source>
        <translation>リファレンスチェック失敗</translation>
    </message>
    <message>
        <source>Instrument Is Full</source>
        <translation>機器のメモリがいっぱいです</translation>
    </message>
    <message>
        <source>There is not enough memory to complete the requested Job. Please remove existing jobs to free up memory.</source>
        <translation>このジョブを完了するためのメモリが不足しています。既存のジョブを削除してメモリを空けてください。</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>エラー</translation>
    </message>
    <message>
        <source>No database entries</source>
        <translation>データベースにエントリがありません</translation>
    </message>
    <message>
        <source>Measurement Cancelled</source>
        <translation>測定はキャンセルされました</translation>
    </message>
    <message>
        <source>The instrument was moved during a measurement</source>
        <translation>測定中に機器が動きました</translation>
    </message>
    <message>
        <source>Index invalid</source>
        <translation>無効なインデックス</translation>
    </message>
    <message>
        <source>Calibration Error</source>
        <translation>校正エラー</translation>
    </message>
    <message>
        <source>Instrument not on white tile, or internal white dirty</source>
        <translation>機器が白色板の上にないか、内部白色板が汚れています</translation>
    </message>
    <message>
        <source>Calibration data not valid</source>
        <translation>校正データが無効です</translation>
    </message>
    <message>
        <source>Not calibrated</source>
        <translation>校正されていません</translation>
    </message>
    <message>
        <source>External white tile too dirty or incorrect white tile</source>
        <translation>外部白色板が汚れすぎているか、白色板が違います</translation>
    </message>
    <message>
        <source>Measurement Aborted</source>
        <translation>測定中止</translation>
    </message>
    <message>
        <source>The measurement has been aborted by the user</source>
        <translation>ユーザーが測定を中止しました</translation>
    </message>
    <message>
        <source>Battery is low. Charge the battery</source>
        <translation>バッテリー残量が少なくなっています。充電してください</translation>
    </message>
    <message>
        <source>Battery is empty. Instrument will shut down</source>
        <translation>バッテリーが空です。機器の電源が切れます</translation>
    </message>
    <message>
        <source>Error in shutter motor</source>
        <translation>シャッターモーターのエラー</translation>
    </message>
    <message>
        <source>No stored reference measurement</source>
        <translation>保存されたリファレンス測定がありません</translation>
    </message>
    <message>
        <source>Spectral integration time on white too long</source>
        <translation>白色での分光積分時間が長すぎます</translation>
    </message>
    <message>
        <source>Wavelength shift above absolute limit of 5 nm</source>
        <translation>波長シフトが絶対限界 5 nm を超えています</translation>
    </message>
    <message>
        <source>Low Storage</source>
        <translation>ストレージ残量不足</translation>
    </message>
    <message>
        <source>Problem occurred changing Wi-Fi modes</source>
        <translation>Wi-Fi モードの切り替え中に問題が発生しました</translation>
    </message>
    <message>
        <source>Problem occurred scanning for Wi-Fi</source>
        <translation>Wi-Fi のスキャン中に問題が発生しました</translation>
    </message>
    <message>
        <source>Sample temperature too high (IR Sensor)</source>
        <translation>サンプル温度が高すぎます（IR センサー）</translation>
    </message>
    <message>
        <source>Sample temperature too low (IR Sensor)</source>
        <translation>サンプル温度が低すぎます（IR センサー）</translation>
    </message>
    <message>
        <source>Battery level is too low for update</source>
        <translation>バッテリー残量が少ないため更新できません</translation>
    </message>
    <message>
        <source>Date and time not set</source>
        <translation>日付と時刻が設定されていません</translation>
    </message>
    <message>
        <source>Problem during initialization. Please reboot the device</source>
        <translation>初期化中に問題が発生しました。機器を再起動してください</translation>
    </message>
    <message>
        <source>Hardware communication error. Please reboot the device</source>
        <translation>ハードウェア通信エラー。機器を再起動してください</translation>
    </message>
    <message>
        <source>Error during measurement</source>
        <translation>測定中のエラー</translation>
    </message>
    <message>
        <source>Different best matches for checkpoints</source>
        <translation>チェックポイントの最適一致が異なります</translation>
    </message>
    <message>
        <source>Calibrating</source>
        <translation>校正中</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
</context>
<context>
    <name>DeleteAllSamplesPopup</name>
    <message>
        <source>Clear Database</source>
        <translation>データベースを消去</translation>
    </message>
    <message>
        <source>Are you sure you want to clear the database, this will delete all samples and jobs from the instrument?</source>
        <translation>データベースを消去しますか？機器のすべてのサンプルとジョブが削除されます。</translation>
    </message>
</context>
<context>
    <name>DeletePopup</name>
    <message>
        <source>Delete All Samples?</source>
        <translation>すべてのサンプルを削除しますか？</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>削除</translation>
    </message>
    <message>
        <source>No</source>
        <translation>いいえ</translation>
    </message>
</context>
<context>
    <name>DeleteSamplePopup</name>
    <message>
        <source>Delete Sample?</source>
        <translation>サンプルを削除しますか？</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>削除</translation>
    </message>
    <message>
        <source>No</source>
        <translation>いいえ</translation>
    </message>
</context>
<context>
    <name>ImageViewScreen</name>
    <message>
        <source>Camera Images</source>
        <translation>カメラ画像</translation>
    </message>
</context>
<context>
    <name>JobActionsPopup</name>
    <message>
        <source>Delete Job</source>
        <translation>ジョブを削除</translation>
    </message>
    <message>
        <source>View/Edit Job</source>
        <translation>ジョブの表示/編集</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>キャンセル</translation>
    </message>
    <message>
        <source>Copy Job</source>
        <translation>ジョブをコピー</translation>
    </message>
    <message>
        <source>Send Job To Server</source>
        <translation>ジョブをサーバーに送信</translation>
    </message>
    <message>
        <source>Execute Job</source>
        <translation>ジョブを実行</translation>
    </message>
</context>
<context>
    <name>JobFreeTextEditScreen</name>
    <message>
        <source>Notes</source>
        <translation>メモ</translation>
    </message>
</context>
<context>
    <name>JobKeypadScreen</name>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
    <message>
        <source>ABC</source>
        <translation>ABC</translation>
    </message>
    <message>
        <source>Special Keys</source>
        <translation>記号</translation>
    </message>
</context>
<context>
    <name>JobListQuickSelectionItem</name>
    <message>
        <source>Delete All Completed Jobs</source>
        <translation>完了したジョブをすべて削除</translation>
    </message>
</context>
<context>
    <name>JobListScreen</name>
    <message>
        <source>Jobs</source>
        <translation>ジョブ</translation>
    </message>
    <message>
        <source>+</source>
        <translation>+</translation>
    </message>
    <message>
        <source>Open</source>
        <translation>未完了</translation>
    </message>
    <message>
        <source>Complete</source>
        <translation>完了</translation>
    </message>
    <message>
        <source>Open (%1)</source>
        <translation>未完了 (%1)</translation>
    </message>
    <message>
        <source>Complete (%1)</source>
        <translation>完了 (%1)</translation>
    </message>
    <message>
        <source>Delete Job?</source>
        <translation>ジョブを削除しますか？</translation>
    </message>
    <message>
        <source>The entire job and all samples will be permanently deleted.</source>
        <translation>ジョブ全体とすべてのサンプルが完全に削除されます。</translation>
    </message>
    <message>
        <source>Delete All Completed Jobs?</source>
        <translation>完了したジョブをすべて削除しますか？</translation>
    </message>
    <message>
        <source>All completed jobs will be permanently deleted.</source>
        <translation>完了したジョブはすべて完全に削除されます。</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
    <message>
        <source>Instrument Is Full</source>
        <translation>機器のメモリがいっぱいです</translation>
    </message>
    <message>
        <source>A new job cannot be created until one or more existing jobs are removed from the instrument.</source>
        <translation>既存のジョブを機器から削除するまで、新しいジョブは作成できません。</translation>
    </message>
    <message>
        <source>There is not enough memory to complete the requested Job. Please remove existing jobs to free up memory.</source>
        <translation>このジョブを完了するためのメモリが不足しています。既存のジョブを削除してメモリを空けてください。</translation>
    </message>
</context>
<context>
    <name>JobMeasureScreen</name>
    <message>
        <source>Summary</source>
        <translation>概要</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>削除</translation>
    </message>
    <message>
        <source>Measure</source>
        <translation>測定</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>保存</translation>
    </message>
    <message>
        <source>Job Details</source>
        <translation>ジョブの詳細</translation>
    </message>
    <message>
        <source>Name:</source>
        <translation>名前:</translation>
    </message>
    <message>
        <source>%1:</source>
        <translation>%1:</translation>
    </message>
    <message>
        <source>Notes:</source>
        <translation>メモ:</translation>
    </message>
    <message>
        <source>Send Job To Server</source>
        <translation>ジョブをサーバーに送信</translation>
    </message>
    <message>
        <source>SMC Results</source>
        <translation>SMC結果</translation>
    </message>
    <message>
        <source>Average Results</source>
        <translation>平均結果</translation>
    </message>
    <message>
        <source>Measurements</source>
        <translation>測定値</translation>
    </message>
    <message>
        <source>%1 of %2 completed</source>
        <translation>%1/%2 完了</translation>
    </message>
    <message>
        <source>Delete Job?</source>
        <translation>ジョブを削除しますか？</translation>
    </message>
    <message>
        <source>The entire job and all samples will be permanently deleted.</source>
        <translation>ジョブ全体とすべてのサンプルが完全に削除されます。</translation>
    </message>
    <message>
        <source>Warning</source>
        <translation>警告</translation>
    </message>
    <message>
        <source>This job was not created on the instrument. Are you sure you want to edit the job?</source>
        <translation>このジョブは本機で作成されたものではありません。編集してもよろしいですか？</translation>
    </message>
    <message>
        <source>Edit</source>
        <translation>編集</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>キャンセル</translation>
    </message>
</context>
<context>
    <name>JobNameEditScreen</name>
    <message>
        <source>Name</source>
        <translation>名前</translation>
    </message>
    <message>
        <source>Job Name cannot be empty</source>
        <translation>ジョブ名を入力してください</translation>
    </message>
    <message>
        <source>Enter a unique job name that is not empty</source>
        <translation>重複しないジョブ名を入力してください</translation>
    </message>
    <message>
        <source>Job Name Already Exists</source>
        <translation>ジョブ名は既に存在します</translation>
    </message>
    <message>
        <source>This job name already exists.  Please change the name to a unique name</source>
        <translation>このジョブ名は既に使われています。別の名前に変更してください</translation>
    </message>
</context>
<context>
    <name>JobTagEditScreen</name>
    <message>
        <source>Tag Name Does Not Exist</source>
        <translation>タグ名が存在しません</translation>
    </message>
    <message>
        <source>This tag name does not exist. Please change the name to an existing tag name</source>
        <translation>このタグ名は存在しません。既存のタグ名に変更してください</translation>
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
        <translation>機器はロックされています</translation>
    </message>
</context>
<context>
    <name>MeasuringPopup</name>
    <message>
        <source>Measuring</source>
        <translation>測定中</translation>
    </message>
    <message>
        <source>Hold Steady</source>
        <translation>動かさないでください</translation>
    </message>
    <message>
        <source>Do not touch or bump instrument</source>
        <translation>機器に触れたりぶつけたりしないでください</translation>
    </message>
    <message>
        <source>Calculating</source>
        <translation>計算中</translation>
    </message>
    <message>
        <source>OK to move instrument</source>
        <translation>機器を動かしてもかまいません</translation>
    </message>
</context>
<context>
    <name>PowerDownPopup</name>
    <message>
        <source>Power Off</source>
        <translation>電源オフ</translation>
    </message>
    <message>
        <source>Reboot</source>
        <translation>再起動</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>キャンセル</translation>
    </message>
</context>
<context>
    <name>RestoreFactorySettingsPopup</name>
    <message>
        <source>Confirm by moving the dot around the circle</source>
        <translation>点を円に沿って一周させて確定します</translation>
    </message>
    <message>
        <source>Restore Factory Settings</source>
        <translation>工場出荷時設定に戻す</translation>
    </message>
    <message>
        <source>All current user settings will go back to defaults. Any jobs or samples will also be lost!</source>
        <translation>すべての設定が初期値に戻ります。ジョブとサンプルもすべて失われます！</translation>
    </message>
</context>
<context>
    <name>SadPuppyScreen</name>
    <message>
        <source>Error</source>
        <translation>エラー</translation>
    </message>
    <message>
        <source>An error has occurred, please reboot the instrument</source>
        <translation>エラーが発生しました。機器を再起動してください</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
</context>
<context>
    <name>SampleDetailsViewer</name>
    <message>
        <source>Color View</source>
        <translation>カラー表示</translation>
    </message>
</context>
<context>
    <name>SampleDetailsViewerD15</name>
    <message>
        <source>15%1 Series</source>
        <translation>15%1 シリーズ</translation>
    </message>
</context>
<context>
    <name>SampleDetailsViewerD45</name>
    <message>
        <source>45%1 Series</source>
        <translation>45%1 シリーズ</translation>
    </message>
</context>
<context>
    <name>SampleDetailsViewerTexture</name>
    <message>
        <source>15%1 Texture</source>
        <translation>15%1 テクスチャ</translation>
    </message>
</context>
<context>
    <name>SampleListSelectionItemComplete</name>
    <message>
        <source>More measurements are needed to complete this job</source>
        <translation>このジョブを完了するには追加の測定が必要です</translation>
    </message>
</context>
<context>
    <name>SampleResultsPage</name>
    <message>
        <source>Measurement</source>
        <translation>測定</translation>
    </message>
    <message>
        <source>Camera Images</source>
        <translation>カメラ画像</translation>
    </message>
</context>
<context>
    <name>SampleViewScreen</name>
    <message>
        <source>Details</source>
        <translation>詳細</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>削除</translation>
    </message>
</context>
<context>
    <name>SelfTestListItem</name>
    <message>
        <source>Pass</source>
        <translation>合格</translation>
    </message>
    <message>
        <source>Fail</source>
        <translation>不合格</translation>
    </message>
    <message>
        <source>Canceled</source>
        <translation>キャンセル</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>エラー</translation>
    </message>
</context>
<context>
    <name>SelfTestPopup</name>
    <message>
        <source>Hold the instrument in open air</source>
        <translation>機器を空中に保持してください</translation>
    </message>
    <message>
        <source>Do not touch or bump instrument</source>
        <translation>機器に触れたりぶつけたりしないでください</translation>
    </message>
    <message>
        <source>Complete</source>
        <translation>完了</translation>
    </message>
</context>
<context>
    <name>SelfTestScreen</name>
    <message>
        <source>Self Test</source>
        <translation>自己診断</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
    <message>
        <source>White Calibration</source>
        <translation>白色校正</translation>
    </message>
    <message>
        <source>Reference check on white</source>
        <translation>白色での基準確認</translation>
    </message>
    <message>
        <source>Effect tile test</source>
        <translation>エフェクトタイル試験</translation>
    </message>
    <message>
        <source>Repeatability tests</source>
        <translation>再現性試験</translation>
    </message>
    <message>
        <source>Temperature tests</source>
        <translation>温度試験</translation>
    </message>
    <message>
        <source>Pressure sensor test</source>
        <translation>圧力センサー試験</translation>
    </message>
    <message>
        <source>Check error logs</source>
        <translation>エラーログ確認</translation>
    </message>
    <message>
        <source>Testing...</source>
        <translation>診断中...</translation>
    </message>
    <message>
        <source>All Tests Complete</source>
        <translation>すべての診断が完了しました</translation>
    </message>
    <message>
        <source>Self Tests Canceled</source>
        <translation>自己診断がキャンセルされました</translation>
    </message>
</context>
<context>
    <name>SettingsDatabaseMemoryPage</name>
    <message>
        <source>Database / Memory</source>
        <translation>データベース／メモリ</translation>
    </message>
    <message>
        <source>Samples</source>
        <translation>サンプル</translation>
    </message>
    <message>
        <source>Jobs</source>
        <translation>ジョブ</translation>
    </message>
    <message>
        <source>Clear Database</source>
        <translation>データベースを消去</translation>
    </message>
</context>
<context>
    <name>SettingsDirectoryExplorerPage</name>
    <message>
        <source>No files</source>
        <translation>ファイルがありません</translation>
    </message>
</context>
<context>
    <name>SettingsDisplayPage</name>
    <message>
        <source>Display Settings</source>
        <translation>ディスプレイ設定</translation>
    </message>
    <message>
        <source>Display Brightness</source>
        <translation>画面の明るさ</translation>
    </message>
</context>
<context>
    <name>SettingsFileViewerPage</name>
    <message>
        <source>The file can&apos;t be shown.</source>
        <translation>ファイルを表示できません。</translation>
    </message>
    <message>
        <source>The file can&apos;t be read.</source>
        <translation>ファイルを読み込めません。</translation>
    </message>
</context>
<context>
    <name>SettingsLanguagePage</name>
    <message>
        <source>Language</source>
        <translation>言語</translation>
    </message>
</context>
<context>
    <name>SettingsLegalInformationPage</name>
    <message>
        <source>Legal Information</source>
        <translation>法的情報</translation>
    </message>
</context>
<context>
    <name>SettingsListSelectionPowerInfo</name>
    <message>
        <source>%1 hour </source>
        <translation>%1時間</translation>
    </message>
    <message>
        <source>%1 hours </source>
        <translation>%1時間</translation>
    </message>
    <message>
        <source>%1 minutes and </source>
        <translation>%1分</translation>
    </message>
    <message>
        <source>%1 seconds</source>
        <translation>%1秒</translation>
    </message>
    <message>
        <source>Never</source>
        <translation>しない</translation>
    </message>
    <message>
        <source>Display dims after: %1
Standby after: %2
Power off after: %3</source>
        <translation>画面減光まで：%1
スタンバイまで：%2
電源オフまで：%3</translation>
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
        <translation>しない</translation>
    </message>
</context>
<context>
    <name>SettingsMainPage</name>
    <message>
        <source>Settings</source>
        <translation>設定</translation>
    </message>
    <message>
        <source>Valid</source>
        <translation>有効</translation>
    </message>
    <message>
        <source>Expired</source>
        <translation>期限切れ</translation>
    </message>
    <message>
        <source>Not Connected</source>
        <translation>未接続</translation>
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
        <translation>電源</translation>
    </message>
    <message>
        <source>Language</source>
        <translation>言語</translation>
    </message>
    <message>
        <source>Calibration</source>
        <translation>校正</translation>
    </message>
    <message>
        <source>Measurement Options</source>
        <translation>測定オプション</translation>
    </message>
    <message>
        <source>Wi-Fi</source>
        <translation>Wi-Fi</translation>
    </message>
    <message>
        <source>Display Settings</source>
        <translation>ディスプレイ設定</translation>
    </message>
    <message>
        <source>Beeper Volume</source>
        <translation>ビープ音量</translation>
    </message>
    <message>
        <source>Power Saving Options</source>
        <translation>省電力オプション</translation>
    </message>
    <message>
        <source>System &amp; Diagnostics</source>
        <translation>システムと診断</translation>
    </message>
</context>
<context>
    <name>SettingsMeasurementPage</name>
    <message>
        <source>On</source>
        <translation>オン</translation>
    </message>
    <message>
        <source>Off</source>
        <translation>オフ</translation>
    </message>
    <message>
        <source>Measurement Options</source>
        <translation>測定オプション</translation>
    </message>
    <message>
        <source>Auto Measurement</source>
        <translation>自動測定</translation>
    </message>
    <message>
        <source>Time to start auto measurement (sec):</source>
        <translation>自動測定開始までの時間（秒）：</translation>
    </message>
    <message>
        <source>Measurement Mode</source>
        <translation>測定モード</translation>
    </message>
    <message>
        <source>No. of good measurements required:</source>
        <translation>必要な良好測定数：</translation>
    </message>
    <message>
        <source>Maximum measurements:</source>
        <translation>最大測定数：</translation>
    </message>
    <message>
        <source>Auto Measurements: %1</source>
        <translation>自動測定：%1</translation>
    </message>
    <message>
        <source>Display LABCH: %1</source>
        <translation>LABCH表示：%1</translation>
    </message>
    <message>
        <source>Override Pressure Sensors: %1</source>
        <translation>圧力センサーを無視：%1</translation>
    </message>
</context>
<context>
    <name>SettingsPowerOptionsPage</name>
    <message>
        <source>Power Saving
Options</source>
        <translation>省電力
オプション</translation>
    </message>
    <message>
        <source>Dim Display</source>
        <translation>画面を暗くする</translation>
    </message>
    <message>
        <source>Standby Mode</source>
        <translation>スタンバイ</translation>
    </message>
    <message>
        <source>Power Off</source>
        <translation>電源オフ</translation>
    </message>
    <message>
        <source>Seconds until display dims:</source>
        <translation>画面が暗くなるまでの秒数：</translation>
    </message>
    <message>
        <source>Minutes until standby mode:</source>
        <translation>スタンバイまでの分数：</translation>
    </message>
    <message>
        <source>Minutes until power off:</source>
        <translation>電源オフまでの分数：</translation>
    </message>
</context>
<context>
    <name>SettingsPowerPage</name>
    <message>
        <source>Power</source>
        <translation>電源</translation>
    </message>
    <message>
        <source>Power Off</source>
        <translation>電源オフ</translation>
    </message>
    <message>
        <source>Reboot</source>
        <translation>再起動</translation>
    </message>
    <message>
        <source>Shutdown Instrument?</source>
        <translation>機器の電源を切りますか？</translation>
    </message>
    <message>
        <source>Are you sure you want to shutdown the instrument?</source>
        <translation>機器の電源を切ってもよろしいですか？</translation>
    </message>
    <message>
        <source>Enter Standby Mode?</source>
        <translation>スタンバイにしますか？</translation>
    </message>
    <message>
        <source>Are you sure you want to put the instrument into standby mode?</source>
        <translation>機器をスタンバイにしてもよろしいですか？</translation>
    </message>
    <message>
        <source>Reboot Instrument?</source>
        <translation>機器を再起動しますか？</translation>
    </message>
    <message>
        <source>Are you sure you want to reboot the instrument?</source>
        <translation>機器を再起動してもよろしいですか？</translation>
    </message>
    <message>
        <source>Yes</source>
        <translation>はい</translation>
    </message>
    <message>
        <source>No</source>
        <translation>いいえ</translation>
    </message>
</context>
<context>
    <name>SettingsSystemAndDiagnosticsPage</name>
    <message>
        <source>System &amp;
Diagnostics</source>
        <translation>システムと
診断</translation>
    </message>
    <message>
        <source>System Information</source>
        <translation>システム情報</translation>
    </message>
    <message>
        <source>Database / Memory</source>
        <translation>データベース／メモリ</translation>
    </message>
    <message>
        <source>Legal Information</source>
        <translation>法的情報</translation>
    </message>
    <message>
        <source>Self Test</source>
        <translation>セルフテスト</translation>
    </message>
</context>
<context>
    <name>SettingsSystemInformationPage</name>
    <message>
        <source>System Information</source>
        <translation>システム情報</translation>
    </message>
    <message>
        <source>Not Configured</source>
        <translation>未設定</translation>
    </message>
    <message>
        <source>Instrument Model:</source>
        <translation>モデル：</translation>
    </message>
    <message>
        <source>Instrument Serial:</source>
        <translation>シリアル番号：</translation>
    </message>
    <message>
        <source>Part Number:</source>
        <translation>部品番号：</translation>
    </message>
    <message>
        <source>White Reference Tile:</source>
        <translation>白色校正板：</translation>
    </message>
    <message>
        <source>Certification Date:</source>
        <translation>認証日：</translation>
    </message>
    <message>
        <source>Firmware Revision:</source>
        <translation>ファームウェア版：</translation>
    </message>
    <message>
        <source>Interface Revision:</source>
        <translation>インターフェース版：</translation>
    </message>
    <message>
        <source>Kernel:</source>
        <translation>カーネル：</translation>
    </message>
    <message>
        <source>Bootloader:</source>
        <translation>ブートローダー：</translation>
    </message>
    <message>
        <source>Server URL:</source>
        <translation>サーバーURL：</translation>
    </message>
    <message>
        <source>Restore Factory Settings</source>
        <translation>工場出荷時設定に戻す</translation>
    </message>
    <message>
        <source>Open Source</source>
        <translation>オープンソース</translation>
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
        <translation>ビープ音量</translation>
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
        <translation>オン</translation>
    </message>
    <message>
        <source>Off</source>
        <translation>オフ</translation>
    </message>
    <message>
        <source>Static IP</source>
        <translation>固定IP</translation>
    </message>
    <message>
        <source>DHCP</source>
        <translation>DHCP</translation>
    </message>
    <message>
        <source>Known Networks</source>
        <translation>登録済みネットワーク</translation>
    </message>
    <message>
        <source>Unknown Networks</source>
        <translation>その他のネットワーク</translation>
    </message>
    <message>
        <source>Connection Issue</source>
        <translation>接続の問題</translation>
    </message>
    <message>
        <source>Incorrect password</source>
        <translation>パスワードが正しくありません</translation>
    </message>
    <message>
        <source>Network not in range</source>
        <translation>ネットワークが圏外です</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
</context>
<context>
    <name>StringTables</name>
    <message>
        <source>English</source>
        <translation>英語</translation>
    </message>
    <message>
        <source>Spanish</source>
        <translation>スペイン語</translation>
    </message>
    <message>
        <source>French</source>
        <translation>フランス語</translation>
    </message>
    <message>
        <source>German</source>
        <translation>ドイツ語</translation>
    </message>
    <message>
        <source>Italian</source>
        <translation>イタリア語</translation>
    </message>
    <message>
        <source>Portuguese</source>
        <translation>ポルトガル語</translation>
    </message>
    <message>
        <source>Japanese</source>
        <translation>日本語</translation>
    </message>
    <message>
        <source>Korean</source>
        <translation>韓国語</translation>
    </message>
    <message>
        <source>Chinese Simplified</source>
        <translation>中国語（簡体字）</translation>
    </message>
    <message>
        <source>Custom</source>
        <translation>カスタム</translation>
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
        <translation>拡散</translation>
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
        <translation>ミッドティア</translation>
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
        <translation>平均化なし</translation>
    </message>
    <message>
        <source>Averaging 3</source>
        <translation>3 回平均</translation>
    </message>
    <message>
        <source>Averaging 5</source>
        <translation>5 回平均</translation>
    </message>
    <message>
        <source>SMC m:n</source>
        <translation>SMC m:n</translation>
    </message>
    <message>
        <source>White Tile</source>
        <translation>白色板</translation>
    </message>
    <message>
        <source>Reference Tile</source>
        <translation>リファレンス板</translation>
    </message>
    <message>
        <source>Lifted</source>
        <translation>持ち上げ</translation>
    </message>
    <message>
        <source>White Tile Complete</source>
        <translation>白色板 完了</translation>
    </message>
    <message>
        <source>Reference Tile Complete</source>
        <translation>リファレンス板 完了</translation>
    </message>
    <message>
        <source>Lifted Complete</source>
        <translation>持ち上げ 完了</translation>
    </message>
</context>
<context>
    <name>SyncScreen</name>
    <message>
        <source>Syncing Job Data</source>
        <translation>ジョブデータを同期中</translation>
    </message>
</context>
<context>
    <name>TargetingScreen</name>
    <message>
        <source>Job</source>
        <translation>ジョブ</translation>
    </message>
    <message>
        <source>Press button to measure.</source>
        <translation>ボタンを押して測定します。</translation>
    </message>
    <message>
        <source>Targeting</source>
        <translation>ターゲティング</translation>
    </message>
    <message>
        <source>Averaged 0 of SMC 0:0</source>
        <translation>平均 0 / SMC 0:0</translation>
    </message>
    <message>
        <source>Measure</source>
        <translation>測定</translation>
    </message>
    <message>
        <source>Terminate</source>
        <translation>終了</translation>
    </message>
    <message>
        <source>Online Mode</source>
        <translation>オンラインモード</translation>
    </message>
    <message>
        <source>Averaged %1 of SMC %2:%3</source>
        <translation>平均 %1 / SMC %2:%3</translation>
    </message>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
    <message>
        <source>Exit Online Mode?</source>
        <translation>オンラインモードを終了しますか？</translation>
    </message>
    <message>
        <source>Exiting online mode will stop targeting and return to the job list.</source>
        <translation>オンラインモードを終了すると、ターゲティングを停止してジョブ一覧に戻ります。</translation>
    </message>
    <message>
        <source>Exit</source>
        <translation>終了</translation>
    </message>
    <message>
        <source>Stop Measuring?</source>
        <translation>測定を中止しますか？</translation>
    </message>
    <message>
        <source>All measured samples and this job will be permanently deleted.</source>
        <translation>測定済みのサンプルとこのジョブはすべて完全に削除されます。</translation>
    </message>
    <message>
        <source>All measured samples from this job will be permanently deleted.</source>
        <translation>このジョブの測定済みサンプルはすべて完全に削除されます。</translation>
    </message>
    <message>
        <source>Warning</source>
        <translation>警告</translation>
    </message>
    <message>
        <source>Continue</source>
        <translation>続行</translation>
    </message>
    <message>
        <source>Temperature out of range.  Continue online mode until complete, or Exit online mode and return to the job list?</source>
        <translation>温度が範囲外です。完了までオンラインモードを続けますか？それともオンラインモードを終了してジョブ一覧に戻りますか？</translation>
    </message>
    <message>
        <source>Temperature out of range.  Continue job until complete, or delete job and all samples and return to the job list?</source>
        <translation>温度が範囲外です。完了までジョブを続けますか？それともジョブと全サンプルを削除して一覧に戻りますか？</translation>
    </message>
    <message>
        <source>Temperature out of range.  Continue job until complete, or delete all samples and return to the job list?</source>
        <translation>温度が範囲外です。完了までジョブを続けますか？それとも全サンプルを削除して一覧に戻りますか？</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>削除</translation>
    </message>
    <message>
        <source>Override Pressure Sensors?</source>
        <translation>圧力センサーを無視しますか？</translation>
    </message>
    <message>
        <source>Not all pressure sensors are active. Press the measure button again to start a measurement, otherwise press the cancel button to return to targeting mode.</source>
        <translation>すべての圧力センサーが有効ではありません。測定するにはもう一度測定ボタンを、ターゲティングに戻るにはキャンセルを押してください。</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>キャンセル</translation>
    </message>
    <message>
        <source>Information</source>
        <translation>お知らせ</translation>
    </message>
    <message>
        <source>Not all pressure sensors are active. Please ensure all pressure sensors are active before measuring</source>
        <translation>すべての圧力センサーが有効ではありません。測定前にすべての圧力センサーが有効であることを確認してください</translation>
    </message>
    <message>
        <source>Continue Measuring?</source>
        <translation>測定を続けますか？</translation>
    </message>
    <message>
        <source>To continue with measurements, press OK</source>
        <translation>測定を続けるには OK を押してください</translation>
    </message>
    <message>
        <source>Job Time Elapsed</source>
        <translation>ジョブの時間切れ</translation>
    </message>
    <message>
        <source>The job wasn&apos;t completed within the allocated time</source>
        <translation>ジョブは割り当て時間内に完了しませんでした</translation>
    </message>
    <message>
        <source>SMC force finished, all readings averaged for result.</source>
        <translation>SMC を強制終了しました。結果は全測定値の平均です。</translation>
    </message>
    <message>
        <source>Maximum number of SMC measurements used for this job</source>
        <translation>このジョブの SMC 測定回数が上限に達しました</translation>
    </message>
    <message>
        <source>Complete</source>
        <translation>完了</translation>
    </message>
    <message>
        <source>The job has completed.  Press OK to exit online mode</source>
        <translation>ジョブが完了しました。OK を押してオンラインモードを終了します</translation>
    </message>
    <message>
        <source>SMC force finished, all readings averaged for result.  Press OK to exit online mode</source>
        <translation>SMC を強制終了し、全測定値を平均しました。OK を押してオンラインモードを終了します</translation>
    </message>
    <message>
        <source>SMC failed after maximum measurements %1, the final results are averaged.  Press OK to exit online mode</source>
        <translation>最大 %1 回の測定で SMC が成立しませんでした。最終結果は平均値です。OK を押してオンラインモードを終了します</translation>
    </message>
</context>
<context>
    <name>TerminateJobPopup</name>
    <message>
        <source>Store Average</source>
        <translation>平均を保存</translation>
    </message>
    <message>
        <source>Restart Job</source>
        <translation>ジョブをやり直す</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>キャンセル</translation>
    </message>
</context>
<context>
    <name>UndoPopup</name>
    <message>
        <source>Undo</source>
        <translation>元に戻す</translation>
    </message>
    <message>
        <source>Back</source>
        <translation>戻る</translation>
    </message>
</context>
<context>
    <name>WebSyncButton</name>
    <message>
        <source>Send All Jobs To Server</source>
        <translation>すべてのジョブをサーバーに送信</translation>
    </message>
</context>
<context>
    <name>WifiPasswordScreen</name>
    <message>
        <source>Password</source>
        <translation>パスワード</translation>
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
