/* The records' layout on 64-bit Linux, which hosts in other languages rely on. Valid C11 and C++. */
#ifndef TESTS_SHAPE_RECORD_LAYOUT_H
#define TESTS_SHAPE_RECORD_LAYOUT_H

#include <assert.h>
#include <stddef.h>

#include "edid_composer.h"

#if defined(__LP64__)

#define SIZE(record, size) static_assert(sizeof(record) == (size), #record)
#define OFFSET(record, member, offset) static_assert(offsetof(record, member) == (offset), #record "." #member)

SIZE(ll_list_t, 24);
OFFSET(ll_list_t, magic, 0);
OFFSET(ll_list_t, type, 4);
OFFSET(ll_list_t, size, 8);
OFFSET(ll_list_t, head, 16);

SIZE(ll_entry_t, 32);
OFFSET(ll_entry_t, data, 0);
OFFSET(ll_entry_t, next, 8);
OFFSET(ll_entry_t, list, 16);
OFFSET(ll_entry_t, type, 24);

SIZE(detailed_timing_t, 60);
OFFSET(detailed_timing_t, valid, 0);
OFFSET(detailed_timing_t, pixel_clock, 4);
OFFSET(detailed_timing_t, h_active, 8);
OFFSET(detailed_timing_t, h_blanking, 12);
OFFSET(detailed_timing_t, h_sync_offset, 16);
OFFSET(detailed_timing_t, h_sync_width, 20);
OFFSET(detailed_timing_t, h_border, 24);
OFFSET(detailed_timing_t, v_active, 28);
OFFSET(detailed_timing_t, v_blanking, 32);
OFFSET(detailed_timing_t, v_sync_offset, 36);
OFFSET(detailed_timing_t, v_sync_width, 40);
OFFSET(detailed_timing_t, v_border, 44);
OFFSET(detailed_timing_t, h_image_size, 48);
OFFSET(detailed_timing_t, v_image_size, 52);
OFFSET(detailed_timing_t, progressive, 56);
OFFSET(detailed_timing_t, stereo, 57);
OFFSET(detailed_timing_t, h_sync_positive, 58);
OFFSET(detailed_timing_t, v_sync_positive, 59);

SIZE(std_timing_t, 12);
OFFSET(std_timing_t, h_active, 0);
OFFSET(std_timing_t, aspect_ratio, 4);
OFFSET(std_timing_t, refresh_rate, 8);

SIZE(short_video_desc_t, 12);
OFFSET(short_video_desc_t, native, 0);
OFFSET(short_video_desc_t, vic, 4);
OFFSET(short_video_desc_t, stereo, 8);

SIZE(short_audio_desc_t, 28);
OFFSET(short_audio_desc_t, type, 0);
OFFSET(short_audio_desc_t, channels, 4);
OFFSET(short_audio_desc_t, frequencies, 8);
OFFSET(short_audio_desc_t, pcm_bits, 12);
OFFSET(short_audio_desc_t, max_bitrate, 16);
OFFSET(short_audio_desc_t, value, 20);
OFFSET(short_audio_desc_t, wma_profile, 24);

SIZE(video_mode_t, 16);
OFFSET(video_mode_t, width, 0);
OFFSET(video_mode_t, height, 4);
OFFSET(video_mode_t, interlaced, 8);
OFFSET(video_mode_t, refresh, 12);

SIZE(compose_cfg_t, 64);
OFFSET(compose_cfg_t, hdmi_current_mode, 0);
OFFSET(compose_cfg_t, audio_mask, 16);
OFFSET(compose_cfg_t, audio_sink_filter, 20);
OFFSET(compose_cfg_t, hdmi_3d_mode, 24);
OFFSET(compose_cfg_t, edid_latency, 28);
OFFSET(compose_cfg_t, spa_offset, 48);
OFFSET(compose_cfg_t, port, 56);

SIZE(edid_t, 320);
OFFSET(edid_t, valid, 0);
OFFSET(edid_t, manufacturer, 1);
OFFSET(edid_t, product_code, 8);
OFFSET(edid_t, serial_number, 12);
OFFSET(edid_t, week, 16);
OFFSET(edid_t, year, 20);
OFFSET(edid_t, version, 24);
OFFSET(edid_t, revision, 25);
OFFSET(edid_t, digital, 26);
OFFSET(edid_t, h_size_cm, 27);
OFFSET(edid_t, v_size_cm, 28);
OFFSET(edid_t, gamma, 32);
OFFSET(edid_t, standby, 36);
OFFSET(edid_t, suspend, 37);
OFFSET(edid_t, active_off, 38);
OFFSET(edid_t, standard_colorspace, 39);
OFFSET(edid_t, preferred_timing, 40);
OFFSET(edid_t, gtf, 41);
OFFSET(edid_t, red_x, 44);
OFFSET(edid_t, red_y, 48);
OFFSET(edid_t, green_x, 52);
OFFSET(edid_t, green_y, 56);
OFFSET(edid_t, blue_x, 60);
OFFSET(edid_t, blue_y, 64);
OFFSET(edid_t, white_x, 68);
OFFSET(edid_t, white_y, 72);
OFFSET(edid_t, est_timings_1, 76);
OFFSET(edid_t, est_timings_2, 80);
OFFSET(edid_t, man_timings, 84);
OFFSET(edid_t, std_timings, 88);
OFFSET(edid_t, dtd_list, 112);
OFFSET(edid_t, serial_string, 136);
OFFSET(edid_t, data_string, 150);
OFFSET(edid_t, monitor_name, 164);
OFFSET(edid_t, min_v_rate, 178);
OFFSET(edid_t, max_v_rate, 179);
OFFSET(edid_t, min_h_rate, 180);
OFFSET(edid_t, max_h_rate, 181);
OFFSET(edid_t, max_pixel_clock, 184);
OFFSET(edid_t, extension_count, 188);
OFFSET(edid_t, checksum, 189);
OFFSET(edid_t, underscan, 190);
OFFSET(edid_t, basic_audio, 191);
OFFSET(edid_t, ycbcr_444, 192);
OFFSET(edid_t, ycbcr_422, 193);
OFFSET(edid_t, video_list, 200);
OFFSET(edid_t, audio_list, 224);
OFFSET(edid_t, speaker, 248);
OFFSET(edid_t, hdmi_present, 251);
OFFSET(edid_t, physical_address, 252);
OFFSET(edid_t, dc_48bit, 256);
OFFSET(edid_t, dc_36bit, 257);
OFFSET(edid_t, dc_30bit, 258);
OFFSET(edid_t, dc_y444, 259);
OFFSET(edid_t, dvi_dual, 260);
OFFSET(edid_t, max_tmds_clock, 264);
OFFSET(edid_t, supports_ai, 268);
OFFSET(edid_t, cnc0, 269);
OFFSET(edid_t, cnc1, 270);
OFFSET(edid_t, cnc2, 271);
OFFSET(edid_t, cnc3, 272);
OFFSET(edid_t, hdmi_video_present, 273);
OFFSET(edid_t, video_latency, 274);
OFFSET(edid_t, audio_latency, 276);
OFFSET(edid_t, i_video_latency, 278);
OFFSET(edid_t, i_audio_latency, 280);
OFFSET(edid_t, hdmi_3d_present, 282);
OFFSET(edid_t, image_size, 283);
OFFSET(edid_t, hdmi_vic_len, 284);
OFFSET(edid_t, hdmi_vic, 288);
OFFSET(edid_t, xvycc601, 316);
OFFSET(edid_t, xvycc709, 317);

SIZE(platform_values_t, 336);
OFFSET(platform_values_t, audio_list, 0);
OFFSET(platform_values_t, video_50_priority, 24);
OFFSET(platform_values_t, video_50_additional, 48);
OFFSET(platform_values_t, video_60_priority, 72);
OFFSET(platform_values_t, video_60_additional, 96);
OFFSET(platform_values_t, modes_4k_x_2k_priority, 120);
OFFSET(platform_values_t, modes_4k_x_2k_addition, 148);
OFFSET(platform_values_t, native_refresh_rate, 176);
OFFSET(platform_values_t, current_mode_set_to_priority, 180);
OFFSET(platform_values_t, geometry_limit, 184);
OFFSET(platform_values_t, audio_pass_through, 188);
OFFSET(platform_values_t, underscan, 192);
OFFSET(platform_values_t, is_tv, 196);
OFFSET(platform_values_t, dc_30bit, 200);
OFFSET(platform_values_t, dc_36bit, 204);
OFFSET(platform_values_t, tmds_override, 208);
OFFSET(platform_values_t, supports_ai, 212);
OFFSET(platform_values_t, speaker_entry, 216);
OFFSET(platform_values_t, xvYCC601, 220);
OFFSET(platform_values_t, xvYCC709, 224);
OFFSET(platform_values_t, native_bit, 228);
OFFSET(platform_values_t, product_id, 232);
OFFSET(platform_values_t, serial, 236);
OFFSET(platform_values_t, week, 240);
OFFSET(platform_values_t, year, 244);
OFFSET(platform_values_t, cnc0, 248);
OFFSET(platform_values_t, cnc1, 252);
OFFSET(platform_values_t, cnc2, 256);
OFFSET(platform_values_t, cnc3, 260);
OFFSET(platform_values_t, manufacturer_id, 264);
OFFSET(platform_values_t, monitor_name, 268);
OFFSET(platform_values_t, monitor_serial, 282);
OFFSET(platform_values_t, established_timings_1, 296);
OFFSET(platform_values_t, established_timings_2, 300);
OFFSET(platform_values_t, manufacturer_timings, 304);
OFFSET(platform_values_t, std_timings, 312);

SIZE(compose_decision_t, 56);
OFFSET(compose_decision_t, size, 0);
OFFSET(compose_decision_t, subject, 4);
OFFSET(compose_decision_t, code, 8);
OFFSET(compose_decision_t, verdict, 12);
OFFSET(compose_decision_t, reason, 16);
OFFSET(compose_decision_t, origins, 20);
OFFSET(compose_decision_t, sink_index, 24);
OFFSET(compose_decision_t, priority_index, 28);
OFFSET(compose_decision_t, addition_index, 32);
OFFSET(compose_decision_t, position, 36);
OFFSET(compose_decision_t, value, 40);

SIZE(hdmi2_block_t, 32);
OFFSET(hdmi2_block_t, length, 0);
OFFSET(hdmi2_block_t, payload, 1);

SIZE(hdmi2_t, 1192);
OFFSET(hdmi2_t, size, 0);
OFFSET(hdmi2_t, svd_count, 4);
OFFSET(hdmi2_t, svds, 8);
OFFSET(hdmi2_t, forum_present, 960);
OFFSET(hdmi2_t, forum_version, 961);
OFFSET(hdmi2_t, max_tmds_rate, 964);
OFFSET(hdmi2_t, scdc, 968);
OFFSET(hdmi2_t, read_request, 969);
OFFSET(hdmi2_t, scramble_low, 970);
OFFSET(hdmi2_t, frl_rate, 971);
OFFSET(hdmi2_t, uhd_vic, 972);
OFFSET(hdmi2_t, dc_48bit_420, 973);
OFFSET(hdmi2_t, dc_36bit_420, 974);
OFFSET(hdmi2_t, dc_30bit_420, 975);
OFFSET(hdmi2_t, allm_present, 976);
OFFSET(hdmi2_t, allm, 977);
OFFSET(hdmi2_t, vrr_present, 978);
OFFSET(hdmi2_t, vrr_min, 979);
OFFSET(hdmi2_t, vrr_max, 980);
OFFSET(hdmi2_t, video_capability_present, 984);
OFFSET(hdmi2_t, ycc_quantization, 985);
OFFSET(hdmi2_t, rgb_quantization, 986);
OFFSET(hdmi2_t, preferred_scan, 987);
OFFSET(hdmi2_t, it_scan, 988);
OFFSET(hdmi2_t, ce_scan, 989);
OFFSET(hdmi2_t, colorimetry_present, 990);
OFFSET(hdmi2_t, colorimetry, 991);
OFFSET(hdmi2_t, gamut_metadata, 992);
OFFSET(hdmi2_t, hdr_static_present, 993);
OFFSET(hdmi2_t, eotfs, 994);
OFFSET(hdmi2_t, metadata_types, 995);
OFFSET(hdmi2_t, luminance_count, 996);
OFFSET(hdmi2_t, luminance, 997);
OFFSET(hdmi2_t, y420_count, 1000);
OFFSET(hdmi2_t, y420_vics, 1001);
OFFSET(hdmi2_t, y420_map_present, 1031);
OFFSET(hdmi2_t, y420_map_bytes, 1032);
OFFSET(hdmi2_t, y420_map, 1033);
OFFSET(hdmi2_t, hdr_dynamic, 1063);
OFFSET(hdmi2_t, hdr10plus, 1095);
OFFSET(hdmi2_t, dolby_vision, 1127);
OFFSET(hdmi2_t, freesync, 1159);

SIZE(hdmi2_values_t, 376);
OFFSET(hdmi2_values_t, size, 0);
OFFSET(hdmi2_values_t, enable, 4);
OFFSET(hdmi2_values_t, vic_priority_list, 8);
OFFSET(hdmi2_values_t, vic_addition_list, 132);
OFFSET(hdmi2_values_t, tmds_limit, 256);
OFFSET(hdmi2_values_t, preferred_extended, 260);
OFFSET(hdmi2_values_t, scdc, 264);
OFFSET(hdmi2_values_t, read_request, 268);
OFFSET(hdmi2_values_t, scramble_low, 272);
OFFSET(hdmi2_values_t, y420, 276);
OFFSET(hdmi2_values_t, dc_30bit_420, 280);
OFFSET(hdmi2_values_t, dc_36bit_420, 284);
OFFSET(hdmi2_values_t, deep_color, 288);
OFFSET(hdmi2_values_t, uhd_vic, 292);
OFFSET(hdmi2_values_t, allm, 296);
OFFSET(hdmi2_values_t, vrr, 300);
OFFSET(hdmi2_values_t, vrr_min, 304);
OFFSET(hdmi2_values_t, vrr_max, 308);
OFFSET(hdmi2_values_t, hdr_gamma, 312);
OFFSET(hdmi2_values_t, hdr_pq, 316);
OFFSET(hdmi2_values_t, hdr_hlg, 320);
OFFSET(hdmi2_values_t, hdr_luminance, 324);
OFFSET(hdmi2_values_t, hdr_max, 328);
OFFSET(hdmi2_values_t, hdr_average, 332);
OFFSET(hdmi2_values_t, hdr_min, 336);
OFFSET(hdmi2_values_t, bt2020_rgb, 340);
OFFSET(hdmi2_values_t, bt2020_ycc, 344);
OFFSET(hdmi2_values_t, bt2020_cycc, 348);
OFFSET(hdmi2_values_t, rgb_quantization, 352);
OFFSET(hdmi2_values_t, ycc_quantization, 356);
OFFSET(hdmi2_values_t, pass_hdr_dynamic, 360);
OFFSET(hdmi2_values_t, pass_hdr10plus, 364);
OFFSET(hdmi2_values_t, pass_dolby_vision, 368);
OFFSET(hdmi2_values_t, pass_freesync, 372);

#undef SIZE
#undef OFFSET

#endif

#endif
