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
        <source>Do not touch or bump instrument</source>
        <translation>機器に触れたりぶつけたりしないでください</translation>
    </message>
    <message>
        <source>Calibrating</source>
        <translation>校正中</translation>
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
        <translation>付属の白色基準タイルを使用して機器を校正します。</translation>
    </message>
    <message>
        <source>Serial Number: %1</source>
        <translation>シリアル番号: %1</translation>
    </message>
    <message>
        <source>Place the instrument on the white calibration tile by aligning the white line on the desired reference.</source>
        <translation>白線を基準に合わせて、機器を白色校正タイルの上に置きます。</translation>
    </message>
    <message>
        <source>Verify your instrument by using the effect reference tile included with your instrument. Serial Number: %1</source>
        <translation>付属のエフェクト基準タイルを使用して機器を確認します。シリアル番号: %1</translation>
    </message>
    <message>
        <source>Place the instrument on the effect reference tile by aligning the white line on the desired reference</source>
        <translation>白線を基準に合わせて、機器をエフェクト基準タイルの上に置きます</translation>
    </message>
    <message>
        <source>Self test your instrument by using the white reference tile included with your instrument. Serial Number: %1</source>
        <translation>付属の白色基準タイルを使用して機器の自己診断を行います。シリアル番号: %1</translation>
    </message>
    <message>
        <source>Place the instrument on the white reference tile by aligning the white line on the desired reference</source>
        <translation>白線を基準に合わせて、機器を白色基準タイルの上に置きます</translation>
    </message>
    <message>
        <source>Self test your instrument by using the effect reference tile included with your instrument. Serial Number: %1</source>
        <translation>付属のエフェクト基準タイルを使用して機器の自己診断を行います。シリアル番号: %1</translation>
    </message>
    <message>
        <source>Self test your instrument by lifting the instrument into open air (not placed on anything)</source>
        <translation>機器を持ち上げて空中に保持し（何にも置かずに）自己診断を行います</translation>
    </message>
</context>
<context>
    <name>CalibrationWizardScreen</name>
    <message>
        <source>Calibration</source>
        <translation>校正</translation>
    </message>
    <message>
        <source>Reference Tile Check</source>
        <translation>基準タイル確認</translation>
    </message>
    <message>
        <source>Self Test %1: %2</source>
        <translation>自己診断 %1: %2</translation>
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
</TS>
